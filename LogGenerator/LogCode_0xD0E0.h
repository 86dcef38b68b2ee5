#pragma once

#include "PacketReader.h"

namespace orvex {

// UTRAN RRC state.
//
//   13  u8  1 when the state is valid
//   14  u8  RRC state
class LogCode_0xD0E0 {
public:
    static constexpr LogCode kCode = 0xD0E0;
    static constexpr std::size_t kExpectedLength = 15;
    static constexpr int kInvalidState = 255;

    explicit LogCode_0xD0E0(Packet packet)
        : _packet(packet)
    {
    }

    // kInvalidState unless the packet holds a state and says that it is valid.
    int state() const
    {
        return _packet.u8(13) == 1 && _packet.contains(14, 1) ? _packet.u8(14) : kInvalidState;
    }

private:
    PacketReader _packet;
};

} // namespace orvex
