#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// A frame of 20 ms on the 1x traffic channel, in one subpacket (C2KSubpacketWriter).
//
// 11, demodulation:
//   24  u8  not 0 when the frame had errors
struct C2K1xTrafficPacket {
    static constexpr LogCode kCode = 0x119D;

    bool hasErrors = false;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
