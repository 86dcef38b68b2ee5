#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// Whether a cell has a broadcast channel of its own for packet data.
//
//   13  u8  0 has none, 1 has one
//   14  20 bytes, not read
struct GPRSPBCCHPacket {
    static constexpr LogCode kCode = 0x51FB;

    bool isPresent = false;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
