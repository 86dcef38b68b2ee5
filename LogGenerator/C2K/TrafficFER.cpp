#include "C2K/TrafficFER.h"

#include <optional>

namespace orvex {

namespace {

constexpr const char* kRate = "TrafficFER";
constexpr const char* kRow = "k1xTrafficFER";

std::optional<float> rateIn(const Dictionary& state)
{
    const double* rate = state[kRate].real();
    return rate ? std::optional(static_cast<float>(*rate)) : std::nullopt;
}

double percent(float rate)
{
    const float product = rate * 100;
    return static_cast<double>(product);
}

} // namespace

void TrafficFER::addFrame(bool isErroneous)
{
    float rate = isErroneous ? 1.0F / 64 : 0.0F;
    if (const auto previous = rateIn(_state)) {
        const float faded = *previous * 63 / 64;
        rate += faded;
    }
    _state.set(kRate, static_cast<double>(rate));
    _publisher.setText(kRow, "%.02f%%", percent(rate));
}

void TrafficFER::endTraffic()
{
    const auto rate = rateIn(_state);
    if (!rate)
        return;
    _publisher.setText(kRow, "%.02f%% (old)", percent(*rate));
    _state.remove(kRate);
}

} // namespace orvex
