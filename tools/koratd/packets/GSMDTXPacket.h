#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// Whether the handset keeps silent in the pauses of speech (discontinuous transmission).
//
//   13  6 bytes, not read
//   19  u8  0 off
struct GSMDTXPacket {
    static constexpr LogCode kCode = 0x5072;

    bool isUsed = false;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
