#pragma once

#include "PacketReader.h"

namespace orvex {

// WCDMA ciphering.
//
//   13  u8  not 0: ciphered
class LogCode_0x4157 {
public:
    static constexpr LogCode kCode = 0x4157;
    static constexpr std::size_t kMinimumLength = 19;

    explicit LogCode_0x4157(Packet packet)
        : _packet(packet)
    {
    }

    bool isCiphered() const { return _packet.u8(13) != 0; }

private:
    PacketReader _packet;
};

} // namespace orvex
