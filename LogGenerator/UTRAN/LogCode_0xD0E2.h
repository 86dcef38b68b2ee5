#pragma once

#include "PacketReader.h"

namespace orvex {

// UTRAN serving cell.
//
//   14  u8   cell access restrictions
//   15  u8   URA identity
//   17  u16  uplink UARFCN
//   19  u16  downlink UARFCN
//   21  s32  cell identity
//   25  u8   bit 0: access class barring, emergency calls only
class LogCode_0xD0E2 {
public:
    static constexpr LogCode kCode = 0xD0E2;
    static constexpr std::size_t kMinimumLength = 26;

    explicit LogCode_0xD0E2(Packet packet)
        : _packet(packet)
    {
    }

    int cellAccessRestrictions() const { return _packet.u8(14); }
    int uraIdentity() const { return _packet.u8(15); }
    int uplinkUARFCN() const { return _packet.u16(17); }
    int downlinkUARFCN() const { return _packet.u16(19); }
    std::int32_t cellIdentity() const { return _packet.s32(21); }
    bool isBarred() const { return _packet.bits(25, 0, 1) == 1; }

private:
    PacketReader _packet;
};

} // namespace orvex
