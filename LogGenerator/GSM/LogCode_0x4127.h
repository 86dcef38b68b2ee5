#pragma once

#include "PacketReader.h"

namespace orvex {

// WCDMA serving cell.
//
//   13  s32  uplink UARFCN
//   17  s32  downlink UARFCN
//   21  s32  cell identity
//   25  u16  URA identity
class LogCode_0x4127 {
public:
    static constexpr LogCode kCode = 0x4127;
    static constexpr std::size_t kMinimumLength = 29;

    explicit LogCode_0x4127(Packet packet)
        : _packet(packet)
    {
    }

    std::int32_t uplinkUARFCN() const { return _packet.s32(13); }
    std::int32_t downlinkUARFCN() const { return _packet.s32(17); }
    std::int32_t cellIdentity() const { return _packet.s32(21); }
    int uraIdentity() const { return _packet.u16(25); }

private:
    PacketReader _packet;
};

} // namespace orvex
