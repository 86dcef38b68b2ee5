#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// How many transport blocks arrived, and how many of them damaged.
//
//   13     u8   n, number of transport channels
//   14     u16  window size, blocks
//   16+9i  transport channel i: u8 identity, s32 blocks received, s32 of them with a wrong checksum
struct WCDMABlockErrorPacket {
    static constexpr LogCode kCode = 0x4116;
    static constexpr std::size_t kLargestCount = 32;

    struct Channel {
        int identity = 0;
        int blocks = 0;
        int errors = 0;
    };

    int windowSize = 0;
    std::vector<Channel> channels;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
