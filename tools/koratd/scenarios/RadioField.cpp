#include "RadioField.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
constexpr double kBehindTheBeam = 15; // dB
constexpr double kUnderground = 60;   // dB

// A walk that stays within about 4 dB and forgets itself in five seconds.
constexpr double kShadowingMemory = 0.98;
constexpr double kShadowingStep = 0.8; // dB

constexpr double kAverageStep = 0.1;
} // namespace

RadioField::RadioField(
    std::vector<Transmitter> transmitters, Underpass underpass, double weakest, double strongest)
    : _transmitters(std::move(transmitters))
    , _underpass(underpass)
    , _weakest(weakest)
    , _strongest(strongest)
    , _shadowing(_transmitters.size())
    , _levels(_transmitters.size(), weakest)
{
}

void RadioField::step(double position, Randomness& randomness)
{
    for (std::size_t i = 0; i < _transmitters.size(); ++i) {
        _shadowing[i] = _shadowing[i] * kShadowingMemory + randomness.normal() * kShadowingStep;
        const double level = _transmitters[i].levelAt20m - loss(_transmitters[i], position) + _shadowing[i];
        _levels[i] = std::clamp(level, _weakest, _strongest);
    }
    if (_averages.empty())
        _averages = _levels;
    for (std::size_t i = 0; i < _levels.size(); ++i)
        _averages[i] += (_levels[i] - _averages[i]) * kAverageStep;
}

double RadioField::loss(const Transmitter& transmitter, double position) const
{
    const double ahead = position - transmitter.position;
    const double distance = std::max(20.0, std::hypot(ahead, transmitter.offset));
    double loss = transmitter.slope * std::log10(distance / 20);
    if (transmitter.direction * ahead < 0)
        loss += kBehindTheBeam;
    const bool isBelow = position >= _underpass.from && position <= _underpass.to;
    if (isBelow != transmitter.isUnderground)
        loss += kUnderground;
    return loss;
}

} // namespace orvex::korat
