#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// How packet data works in a cell.
//
//   13  2 bytes, not read
//   15  u8  T3192, how long the handset waits on the channel after the last block: 0 500 ms, 1 1000 ms,
//           2 1500 ms, 3 0 ms, 4 80 ms, 5 120 ms, 6 160 ms, 7 200 ms
//   16  u8  longest time without discontinuous reception after a transfer, s
//   17  u8  access bursts: 0 of 8 bits, else of 11
//   18  6 bytes, not read
struct GPRSCellOptionsPacket {
    static constexpr LogCode kCode = 0x51F6;

    int t3192 = 0;         // as coded
    int longestNonDRX = 0; // s
    bool hasLongBursts = false;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
