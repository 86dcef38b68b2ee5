#pragma once

#include "packets/MessageSource.h"

namespace orvex::korat {

struct ScenarioSettings {
    std::uint64_t seed = 1; // the same seed gives the same messages
    Microseconds start{};   // the time of the first packet, since 1970
};

// What happens to a handset, as the messages that its baseband would log. It never ends.
class Scenario : public MessageSource {
public:
    virtual Item next() = 0;
    std::optional<Item> nextIfAny() final { return next(); }
};

} // namespace orvex::korat
