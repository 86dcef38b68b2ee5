#pragma once

#include "LogMessage.h"

#include <array>
#include <cstddef>

namespace orvex::korat {

// What has gone over the EV-DO reverse link since power-up, as counters of physical-layer packets by their
// size. Receivers compute the rate from two reports, as on the forward link.
//
//   14                 u32  sequence number, in units of 1024 ms
//   18+576j+288h+24r+4s  u32  packets of size r, in block j (0 to 2), half h (0 and 1), column s (0 to 3)
struct C2KReverseLinkPacket {
    static constexpr LogCode kCode = 0x127E;
    static constexpr std::size_t kSizeCount = 12;
    static constexpr std::size_t kBlockCount = 3;
    static constexpr std::size_t kHalfCount = 2;
    static constexpr std::size_t kColumnCount = 4;

    // Bits in a packet of each size.
    static constexpr std::array<int, kSizeCount> kBits = {
        128, 256, 512, 768, 1024, 1536, 2048, 3072, 4096, 6144, 8192, 12288};

    // The counters of one size. They start from 0 again after the largest number.
    struct Counters {
        std::uint32_t packets[kBlockCount][kHalfCount][kColumnCount] = {};
    };

    std::uint32_t sequenceNumber = 0;
    std::array<Counters, kSizeCount> sizes{};

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
