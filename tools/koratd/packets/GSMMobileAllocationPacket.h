#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// The carriers that a call hops over.
//
//   13     u8   hopping sequence number
//   14     u8   n, number of carriers
//   15+2i  u16  ARFCN of carrier i
struct GSMMobileAllocationPacket {
    static constexpr LogCode kCode = 0x51F8;
    static constexpr std::size_t kLargestCount = 64;

    int hoppingSequenceNumber = 0; // 0 hops cyclically, 1 to 63 pseudo-randomly
    std::vector<int> arfcns;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
