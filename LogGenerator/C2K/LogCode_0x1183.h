#pragma once

#include "PacketReader.h"

namespace orvex {

// EV-DO status.
//
//   13  u8   channel, low 8 bits
//   14  u8   bits 0-2 channel, high bits; bits 3-7 band class
//   15  s8   receive AGC of antenna 0, dBm
//   16  s8   receive AGC of antenna 1, dBm
//   17  s8   transmit AGC, dBm
//   18  u16  serving PN offset, 64 chips; 65535 for none
//   36  u8   device state
//   37  u8   session state
//   38  u24  UATI, low 24 bits
//   41  u8   colour code
class LogCode_0x1183 {
public:
    static constexpr LogCode kCode = 0x1183;
    static constexpr std::size_t kLength = 50; // neither more nor less

    static constexpr int kNoPNOffset = 65535;

    explicit LogCode_0x1183(Packet packet)
        : _packet(packet)
    {
    }

    int channel() const { return static_cast<int>(_packet.bits(13, 0, 11)); }
    int bandClass() const { return static_cast<int>(_packet.bits(14, 3, 5)); }
    int rxAGC0() const { return _packet.s8(15); } // dBm
    int rxAGC1() const { return _packet.s8(16); } // dBm
    int txAGC() const { return _packet.s8(17); }  // dBm
    int servingPNOffset() const { return _packet.u16(18); }
    int deviceState() const { return _packet.u8(36); }
    int sessionState() const { return _packet.u8(37); }
    unsigned uati24() const { return _packet.bits(38, 0, 24); }
    int colorCode() const { return _packet.u8(41); }

private:
    PacketReader _packet;
};

} // namespace orvex
