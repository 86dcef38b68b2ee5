#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// The carrier of the channel that a call uses.
//
//   13  u16  ARFCN, of which readers show the low byte
//   15  2 bytes, not read
struct GSMDedicatedChannelPacket {
    static constexpr LogCode kCode = 0x5076;

    int arfcn = 0;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
