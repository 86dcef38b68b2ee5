#pragma once

#include "packets/LogMessage.h"
#include "scenarios/Randomness.h"

namespace orvex::korat {

// Replaces a share of the messages by garbage: random bytes, random payloads behind a true header, wrong log
// types, packets that end too early.
//
// It never makes an extra packet whose property list is broken (codes 0 to 2): receivers do not survive that,
// and are not meant to.
class GarbageSource {
public:
    GarbageSource(int percent, std::uint64_t seed)
        : _share(percent / 100.0)
        , _randomness(seed)
    {
    }

    // The message or, by chance, what comes in its place. An empty one is bad enough as it is.
    Bytes pass(Bytes message);

private:
    Bytes garbage(const Bytes& message);

    double _share;
    Randomness _randomness;
};

// Whether a receiver would read the message as an extra packet with one of the property lists.
bool isReadAsPropertyList(const Bytes& message);

} // namespace orvex::korat
