#pragma once

#include "LogMessage.h"

#include <array>
#include <vector>

namespace orvex::korat {

// Quality of the transport channels (TRCH) and of the coded composite ones (CCTRCH).
//
//   14          bits 6-11 t, number of TRCHs; bits 12-15 k, number of CCTRCHs
//   17+2i       TRCH i: u8 identity, u8 block error rate
//   289+34t+8j  CCTRCH j: u8 identity, u8 timeslot, 6 times u8 SIR
//
// The second list keeps a distance of 34 bytes for every TRCH, though a TRCH takes only 2.
struct UTRANTransportChannelPacket {
    static constexpr LogCode kCode = 0xD00C;
    static constexpr std::size_t kLargestChannelCount = 63;
    static constexpr std::size_t kLargestCompositeCount = 15;

    struct Channel {
        int identity = 0;
        int blockErrorRate = 0; // 0 to 63, 0 is none
    };
    struct Composite {
        int identity = 0;
        int timeslot = 0;
        std::array<int, 6> sir{};
    };

    std::vector<Channel> channels;
    std::vector<Composite> composites;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
