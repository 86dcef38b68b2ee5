#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// What the HARQ processes of the fast downlink (HSDPA) received.
//
//   13         u8    version
//   14         bits 0-9 subframes since the last report, bits 10-11 carriers
//   16         u8    p, number of processes of the primary carrier
//   17         u8    s, number of processes of the secondary carrier
//   18+9i      process i of the primary carrier: u8 identity, u32 bits received, u16 blocks sent for the
//              first time, u16 blocks received in error
//   18+162p+9j process j of the secondary carrier, likewise
//
// The second list keeps a distance of 162 bytes for every process of the first, though one takes only 9.
struct WCDMAHARQPacket {
    static constexpr LogCode kCode = 0x4221;
    static constexpr std::size_t kLargestCount = 16; // of each carrier

    enum class Carriers : std::uint8_t { single = 0, mimo = 1, dual = 2 };

    struct Process {
        int identity = 0;
        std::int64_t bits = 0;
        int newBlocks = 0;
        int blockErrors = 0;
    };

    int version = 1;
    int subframes = 0; // 2 ms each
    Carriers carriers = Carriers::single;
    std::vector<Process> primary;
    std::vector<Process> secondary;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
