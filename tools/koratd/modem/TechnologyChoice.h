#pragma once

#include "modem/ModemState.h"

#include <chrono>

namespace orvex::korat {

// The log technology that shows a modem best: that of its serving cell. A cell of another technology has to
// serve for 10 seconds before the choice follows it.
class TechnologyChoice {
public:
    using Time = std::chrono::steady_clock::time_point;

    static constexpr std::chrono::seconds kSettleTime{10};

    // Chooses at once, for a monitor that asks.
    const std::string& choose(const ModemState& state);
    const std::string& follow(const ModemState& state, Time now);

private:
    std::string _current;
    std::string _next; // differs from the current one, since that time; else empty
    Time _since;
};

} // namespace orvex::korat
