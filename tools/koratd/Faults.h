#pragma once

#include "Source.h"

#include <chrono>
#include <optional>
#include <random>
#include <string_view>

namespace orvex::korat {

// What the service does wrong, so that monitors can be tried against it.
struct Faults {
    std::optional<int> refuseChannel; // every request for a log channel fails with this error code
    bool nullPort = false;            // the log channel is granted without the name of its port
    bool noReply = false;             // the technology query is not answered
    bool badReply = false;            // it is answered with bytes that are no property list
    bool unknownTechnology = false;   // it is answered with a technology that nobody knows
    std::optional<std::chrono::milliseconds> dieAfter; // the process ends that long after the first channel
    int garbagePercent = 0;                            // share of the packets that are replaced by garbage

    // Adds the one that an option names: "name" or "name=value". False when there is none like it.
    bool add(std::string_view option);
};

// Replaces a share of the packets by garbage: random bytes, random payloads behind a true header, wrong log
// types, packets that end too early. The same packets become the same garbage every time.
//
// Receivers do not survive a broken property list, by design. So messages that are no packets but whole
// property lists stay as they are, and no garbage is an extra packet with one.
class GarbageSource {
public:
    explicit GarbageSource(int percent)
        : _percent(percent)
    {
    }

    // Replaces the message's bytes, by chance.
    void spoil(Message& message);

private:
    // From the first to the last, both included.
    int number(int first, int last) { return std::uniform_int_distribution<>(first, last)(_random); }
    Bytes garbage(const Bytes& message);

    int _percent;
    std::minstd_rand _random;
};

} // namespace orvex::korat
