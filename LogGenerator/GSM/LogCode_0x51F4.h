#pragma once

#include "PacketReader.h"

namespace orvex {

// Where system information 13 stands.
//
//   14  u8  position
class LogCode_0x51F4 {
public:
    static constexpr LogCode kCode = 0x51F4;
    static constexpr std::size_t kMinimumLength = 15;

    explicit LogCode_0x51F4(Packet packet)
        : _packet(packet)
    {
    }

    int si13Position() const { return _packet.u8(14); }

private:
    PacketReader _packet;
};

} // namespace orvex
