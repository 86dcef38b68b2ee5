#pragma once

#include "PacketReader.h"

namespace orvex {

// WCDMA RRC state.
//
//   13  u8  state
class LogCode_0x4125 {
public:
    static constexpr LogCode kCode = 0x4125;
    static constexpr std::size_t kMinimumLength = 14;

    explicit LogCode_0x4125(Packet packet)
        : _packet(packet)
    {
    }

    int state() const { return _packet.u8(13); }

private:
    PacketReader _packet;
};

} // namespace orvex
