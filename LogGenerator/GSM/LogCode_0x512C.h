#pragma once

#include "PacketReader.h"

namespace orvex {

// GSM radio resource state.
//
//   13  u8  state
//   14  u8  sub-state
//   15  u8  status
//   16  u8  mode: 0 voice, any other data
class LogCode_0x512C {
public:
    static constexpr LogCode kCode = 0x512C;
    static constexpr std::size_t kMinimumLength = 17;

    explicit LogCode_0x512C(Packet packet)
        : _packet(packet)
    {
    }

    int state() const { return _packet.u8(13); }
    int subState() const { return _packet.u8(14); }
    int status() const { return _packet.u8(15); }
    bool isData() const { return _packet.u8(16) != 0; }

private:
    PacketReader _packet;
};

} // namespace orvex
