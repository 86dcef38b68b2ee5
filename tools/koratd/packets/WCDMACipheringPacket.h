#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// Whether what is sent on UMTS is ciphered.
//
//   13  u8  0 disabled
//   14  5 bytes, not read
struct WCDMACipheringPacket {
    static constexpr LogCode kCode = 0x4157;

    bool isEnabled = false;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
