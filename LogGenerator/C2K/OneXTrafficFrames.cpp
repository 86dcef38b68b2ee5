#include "C2K/OneXTrafficFrames.h"

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

void OneXTrafficFrames::decode(Packet packet, Dictionary& state, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x119D>(packet))
        return;
    const auto demodulation = LogCode_0x119D(packet).trafficDemodulation();
    if (!demodulation) {
        systemLog(Priority::warning, "Log code 0x119d: missing traffic demod subpacket.");
        return;
    }
    if (const auto error = LogCode_0x119D::TrafficDemodulation(*demodulation).frameError())
        TrafficFER(state, publisher).addFrame(*error != 0);
}

} // namespace orvex
