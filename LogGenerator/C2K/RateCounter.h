#pragma once

#include "C2K/Publisher.h"

namespace orvex {

// Where a link keeps its counters and shows its rate.
struct RateCounterNames {
    const char* rateKey; // internal key of the row
    const char* sequence;
    const char* sent;
    const char* sequence1; // in "ExtraInfo": the newer and the older of the counters that gave the rate
    const char* sent1;
    const char* sequence2;
    const char* sent2;
};

// The data rate of one link, from the bits counted up to each of two successive packets. The sequence number
// counts seconds, a kilobit is 1024 bits. The generator state keeps the counters of the last packet.
class RateCounter {
public:
    RateCounter(const RateCounterNames& names, Dictionary& state, const Publisher& publisher)
        : _names(names)
        , _state(state)
        , _publisher(publisher)
    {
    }

    // A first packet empties the row; one whose sequence number did not grow leaves it.
    void update(std::int32_t sequence, std::int64_t sent);

private:
    void publishRate(std::uint32_t sequenceDifference, std::int64_t sentDifference) const;

    const RateCounterNames& _names;
    Dictionary& _state;
    const Publisher& _publisher;
};

} // namespace orvex
