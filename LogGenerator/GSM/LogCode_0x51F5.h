#pragma once

#include "PacketReader.h"

namespace orvex {

// GPRS options of the cell, part one.
//
//   13  u8  packet flow context supported
//   14  u8  priority access threshold
//   15  u8  network control order
class LogCode_0x51F5 {
public:
    static constexpr LogCode kCode = 0x51F5;
    static constexpr std::size_t kMinimumLength = 18;

    explicit LogCode_0x51F5(Packet packet)
        : _packet(packet)
    {
    }

    int packetFlowContext() const { return _packet.u8(13); }
    int priorityAccessThreshold() const { return _packet.u8(14); }
    int networkControlOrder() const { return _packet.u8(15); }

private:
    PacketReader _packet;
};

} // namespace orvex
