#pragma once

#include "PacketReader.h"

namespace orvex {

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

} // namespace orvex
