#include "SteppedScenario.h"

#include <utility>

namespace orvex::korat {

Scenario::Item SteppedScenario::next()
{
    while (_due.empty()) {
        step();
        ++_stepNumber;
    }
    Item item = std::move(_due.front());
    _due.pop_front();
    return item;
}

} // namespace orvex::korat
