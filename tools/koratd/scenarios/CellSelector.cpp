#include "CellSelector.h"

namespace orvex::korat {

bool CellSelector::step(const RadioField& field)
{
    std::size_t best = 0;
    for (std::size_t i = 1; i < field.size(); ++i) {
        if (field.average(i) > field.average(best))
            best = i;
    }
    if (_serving == kNone) {
        _serving = best;
        return true;
    }
    if (field.average(best) < field.average(_serving) + _margin) {
        _stepsBetter = 0;
        return false;
    }
    _stepsBetter = best == _better ? _stepsBetter + 1 : 1;
    _better = best;
    if (_stepsBetter < _stepsToTrigger)
        return false;
    _serving = best;
    _stepsBetter = 0;
    return true;
}

} // namespace orvex::korat
