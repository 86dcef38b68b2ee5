#pragma once

#include "PacketReader.h"

namespace orvex {

// GPRS mobility management state.
//
//   13  u8  state
//   14  u8  sub-state
//   15  u8  update status
class LogCode_0x7130 {
public:
    static constexpr LogCode kCode = 0x7130;
    static constexpr std::size_t kMinimumLength = 16;

    explicit LogCode_0x7130(Packet packet)
        : _packet(packet)
    {
    }

    int state() const { return _packet.u8(13); }
    int subState() const { return _packet.u8(14); }
    int updateStatus() const { return _packet.u8(15); }

private:
    PacketReader _packet;
};

} // namespace orvex
