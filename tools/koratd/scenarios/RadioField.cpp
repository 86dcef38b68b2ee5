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

// Distances change slowly, and logarithms are what a step spends its time on: each is taken anew only in
// every fifth step.
constexpr std::size_t kTurns = 5;
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
    const bool isFirst = _losses.empty();
    _losses.resize(_transmitters.size());
    for (std::size_t i = isFirst ? 0 : _turn; i < _transmitters.size(); i += isFirst ? 1 : kTurns)
        _losses[i] = loss(_transmitters[i], position);
    _turn = (_turn + 1) % kTurns;
    for (std::size_t i = 0; i < _transmitters.size(); ++i) {
        _shadowing[i] = _shadowing[i] * kShadowingMemory + randomness.normal() * kShadowingStep;
        const double level = _transmitters[i].levelAt20m - _losses[i] + _shadowing[i];
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
    // Squares, as a root and a logarithm cost more than the rest together.
    const double square = std::max(20.0 * 20.0, ahead * ahead + transmitter.offset * transmitter.offset);
    double loss = transmitter.slope / 2 * std::log10(square / (20.0 * 20.0));
    if (transmitter.direction * ahead < 0)
        loss += kBehindTheBeam;
    const bool isBelow = position >= _underpass.from && position <= _underpass.to;
    if (isBelow != transmitter.isUnderground)
        loss += kUnderground;
    return loss;
}

} // namespace orvex::korat
