#pragma once

#include "PacketReader.h"

namespace orvex {

// Registration.
//
//   13  u8  registration state
//   14  u8  PLMN selection mode
class LogCode_0x7132 {
public:
    static constexpr LogCode kCode = 0x7132;
    static constexpr std::size_t kMinimumLength = 16;

    explicit LogCode_0x7132(Packet packet)
        : _packet(packet)
    {
    }

    int registrationState() const { return _packet.u8(13); }
    int plmnSelectionMode() const { return _packet.u8(14); }

private:
    PacketReader _packet;
};

} // namespace orvex
