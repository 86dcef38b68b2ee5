#pragma once

#include "PacketReader.h"

#include <algorithm>
#include <array>
#include <chrono>

namespace orvex::bench {

// What the sender of the port benchmark sends: a log packet of 100 bytes with three LTE neighbours. Where
// packets have their time it has that of its sending, on a clock that both processes read.
inline constexpr std::size_t kPortMessageSize = 100;
inline constexpr std::size_t kPortMessageTime = 5; // 8 bytes, as they stand in memory
inline constexpr std::size_t kPortMessageNeighbors = 3;

inline Bytes portMessage()
{
    constexpr std::array<std::uint8_t, 21> kBeginning = {1, kPortMessageSize - 1, 0, 0x80, 0xB1, 0, 0, 0, 0,
        0, 0, 0,
        0, // so far the header
        3, 0, 0, 0, 0x9C, 0x18, (kPortMessageNeighbors - 1) << 6, 0};
    Bytes message(kPortMessageSize, 0x55);
    std::ranges::copy(kBeginning, message.begin());
    return message;
}

inline std::chrono::steady_clock::rep portTime()
{
    return std::chrono::steady_clock::now().time_since_epoch().count();
}

} // namespace orvex::bench
