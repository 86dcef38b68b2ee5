#pragma once

#include "PacketReader.h"

namespace orvex {

// LTE antennas.
//
//   20  u8  number of transmit antennas
class LogCode_0xB0C1 {
public:
    static constexpr LogCode kCode = 0xB0C1;
    static constexpr std::size_t kMinimumLength = 22;

    explicit LogCode_0xB0C1(Packet packet)
        : _packet(packet)
    {
    }

    int transmitAntennas() const { return _packet.u8(20); }

private:
    PacketReader _packet;
};

} // namespace orvex
