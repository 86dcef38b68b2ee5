#pragma once

#include <chrono>
#include <optional>

namespace orvex::korat {

// What a service can do wrong, for its clients to practise on.
struct Faults {
    std::optional<int> refuseChannel; // every request for a log channel fails with this error code
    bool nullPort = false;            // the log channel is granted without the name of its port
    bool noReply = false;             // the technology query is not answered
    bool badReply = false;            // it is answered with bytes that are no property list
    bool unknownTechnology = false;   // it is answered with a technology that nobody knows
    std::optional<std::chrono::milliseconds> dieAfter; // the process ends that long after the first channel
    int garbagePercent = 0;                            // share of the messages that are replaced by garbage
};

} // namespace orvex::korat
