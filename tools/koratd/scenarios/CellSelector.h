#pragma once

#include "RadioField.h"

#include <cstddef>

namespace orvex::korat {

// Which cell serves: the handset moves to another one when that has been better by a margin for some time.
class CellSelector {
public:
    // The margin in dB, the time in steps of the field.
    CellSelector(double margin, int stepsToTrigger)
        : _margin(margin)
        , _stepsToTrigger(stepsToTrigger)
    {
    }

    // Looks at the levels after a step of the field; true when the serving cell has changed.
    bool step(const RadioField& field);

    std::size_t serving() const { return _serving; }

private:
    static constexpr std::size_t kNone = static_cast<std::size_t>(-1);

    double _margin;
    int _stepsToTrigger;
    std::size_t _serving = kNone;
    std::size_t _better = kNone; // the cell that may take over
    int _stepsBetter = 0;
};

} // namespace orvex::korat
