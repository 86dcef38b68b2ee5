#pragma once

#include "PacketReader.h"

namespace orvex {

// GSM dedicated channel.
//
//   13  u16  ARFCN, of which the low 8 bits are shown
class LogCode_0x5076 {
public:
    static constexpr LogCode kCode = 0x5076;
    static constexpr std::size_t kMinimumLength = 17;

    explicit LogCode_0x5076(Packet packet)
        : _packet(packet)
    {
    }

    // ARFCN modulo 256: the display has never shown more of it.
    int arfcnLowByte() const { return _packet.u16(13) & 0xFF; }

private:
    PacketReader _packet;
};

} // namespace orvex
