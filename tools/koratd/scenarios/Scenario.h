#pragma once

#include "packets/LogMessage.h"

#include <vector>

namespace orvex::korat {

struct ScenarioSettings {
    std::uint64_t seed = 1; // the same seed gives the same messages
    Microseconds start{};   // the time of the first packet, since 1970
};

// What happens to a handset, as the messages that its baseband would log. It runs on a clock of its own, as
// fast as it is asked, and never ends.
class Scenario {
public:
    struct Item {
        Microseconds due{}; // since the scenario's start
        LogMessage message;
    };

    virtual ~Scenario() = default;

    // The next message; their times never go back.
    virtual Item next() = 0;
    // The codes of all messages that can come; empty when they carry none.
    virtual std::vector<LogCode> codes() const = 0;
};

} // namespace orvex::korat
