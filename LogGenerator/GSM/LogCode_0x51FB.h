#pragma once

#include "PacketReader.h"

namespace orvex {

// Packet broadcast control channel of the cell.
//
//   13  u8  1 when there is one
class LogCode_0x51FB {
public:
    static constexpr LogCode kCode = 0x51FB;
    static constexpr std::size_t kMinimumLength = 34;

    explicit LogCode_0x51FB(Packet packet)
        : _packet(packet)
    {
    }

    int pbcchPresent() const { return _packet.u8(13); }

private:
    PacketReader _packet;
};

} // namespace orvex
