#pragma once

#include "PacketReader.h"

namespace orvex {

// GPRS options of the cell, part two.
//
//   15  u8  T3192, coded as in 3GPP TS 44.060, table 12.24.2
//   16  u8  largest DRX timer, s
//   17  u8  access burst: 0 has 8 bits, any other 11
class LogCode_0x51F6 {
public:
    static constexpr LogCode kCode = 0x51F6;
    static constexpr std::size_t kMinimumLength = 24;

    explicit LogCode_0x51F6(Packet packet)
        : _packet(packet)
    {
    }

    int t3192() const { return _packet.u8(15); }
    int drxTimerMax() const { return _packet.u8(16); }
    bool hasLongAccessBurst() const { return _packet.u8(17) != 0; }

private:
    PacketReader _packet;
};

} // namespace orvex
