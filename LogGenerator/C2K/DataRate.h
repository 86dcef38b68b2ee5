#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

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

    // The first packet empties the row; a packet whose sequence number did not grow leaves it as it is.
    void update(std::int32_t sequence, std::int64_t sent);

private:
    void publishRate(std::uint32_t sequenceDifference, std::int64_t sentDifference) const;

    const RateCounterNames& _names;
    Dictionary& _state;
    const Publisher& _publisher;
};

// EV-DO forward link: packets received so far, by format.
//
//   13    u32  sequence number
//   17+4i u32  packets of format i, of 56
class LogCode_0x1192 {
public:
    static constexpr LogCode kCode = 0x1192;
    static constexpr std::size_t kMinimumLength = 241;
    static constexpr std::size_t kFormats = 56;

    explicit LogCode_0x1192(Packet packet)
        : _packet(packet)
    {
    }

    std::int32_t sequence() const { return _packet.s32(13); }
    std::uint32_t packets(std::size_t format) const { return _packet.u32(17 + 4 * format); }

private:
    PacketReader _packet;
};

// EV-DO forward link counters: the data rate that the handset receives.
class ForwardLinkRate {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

// EV-DO reverse link: packets sent so far, by rate.
//
//   14            u32  sequence number
//   18+576j+24r   rate r of 12, in block j of 3: four u32 counters at 0, and four more at 288
class LogCode_0x127E {
public:
    static constexpr LogCode kCode = 0x127E;
    static constexpr std::size_t kMinimumLength = 1750;
    static constexpr std::size_t kRates = 12;

    explicit LogCode_0x127E(Packet packet)
        : _packet(packet)
    {
    }

    std::int32_t sequence() const { return _packet.s32(14); }
    // The sum of the rate's 24 counters.
    std::int64_t packets(std::size_t rate) const
    {
        std::int64_t sum = 0;
        for (std::size_t block = 0; block < 3; ++block) {
            const std::size_t start = 18 + 576 * block + 24 * rate;
            for (std::size_t counter = 0; counter < 4; ++counter) {
                sum += _packet.u32(start + 4 * counter);
                sum += _packet.u32(start + 288 + 4 * counter);
            }
        }
        return sum;
    }

private:
    PacketReader _packet;
};

// EV-DO reverse link counters: the data rate that the handset sends.
class ReverseLinkRate {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
