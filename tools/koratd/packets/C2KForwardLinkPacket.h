#pragma once

#include "LogMessage.h"

#include <array>
#include <cstddef>

namespace orvex::korat {

// What has come over the EV-DO forward link since power-up, as counters of physical-layer packets by their
// format. Receivers compute the rate from two reports: bits over sequence numbers, whose unit is 1024 ms.
//
//   13     u32  sequence number
//   17+4i  u32  counter i; it starts from 0 again after the largest number
struct C2KForwardLinkPacket {
    static constexpr LogCode kCode = 0x1192;
    static constexpr std::size_t kFormatCount = 56;

    // Bits in a packet of each format. The counters of 0 bits end the group of one transmission rate, and
    // count what could not be decoded at it.
    static constexpr std::array<int, kFormatCount> kBits = {128, 256, 512, 1024, 0, 128, 256, 512, 1024, 0,
        128, 256, 512, 1024, 0, 128, 256, 512, 1024, 0, 128, 256, 512, 1024, 0, 512, 1024, 2048, 0, 128, 256,
        512, 1024, 0, 512, 1024, 2048, 0, 1024, 3072, 0, 512, 1024, 2048, 0, 4096, 0, 1024, 3072, 0, 4096, 0,
        5120, 0, 5120, 0};

    std::uint32_t sequenceNumber = 0;
    std::array<std::uint32_t, kFormatCount> packets{};

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
