#pragma once

#include "PacketReader.h"

namespace orvex {

// GSM cell information.
//
//   13  u16  ARFCN
//   15  u16  BSIC
//   17  u16  cell identity
class LogCode_0x5134 {
public:
    static constexpr LogCode kCode = 0x5134;
    static constexpr std::size_t kMinimumLength = 26;

    explicit LogCode_0x5134(Packet packet)
        : _packet(packet)
    {
    }

    int arfcn() const { return _packet.u16(13); }
    int bsic() const { return _packet.u16(15); }
    int cellIdentity() const { return _packet.u16(17); }

private:
    PacketReader _packet;
};

} // namespace orvex
