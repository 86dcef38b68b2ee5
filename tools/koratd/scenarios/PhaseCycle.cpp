#include "PhaseCycle.h"

namespace orvex::korat {

bool PhaseCycle::step(double seconds, bool isHeldBack, Randomness& randomness)
{
    const bool isFirstStep = _end == 0;
    if (isFirstStep || (isHeldBack && _current != 0)) {
        begin(0, seconds, randomness);
        return true;
    }
    if (isHeldBack || seconds < _end)
        return false;
    begin(_current + 1 < _phases.size() ? _current + 1 : _again, seconds, randomness);
    return true;
}

void PhaseCycle::begin(std::size_t phase, double seconds, Randomness& randomness)
{
    _current = phase;
    _begin = seconds;
    _end = seconds + randomness.number(_phases[phase].shortest, _phases[phase].longest);
}

} // namespace orvex::korat
