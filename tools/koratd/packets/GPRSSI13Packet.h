#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// Where a GSM cell broadcasts what it offers to GPRS (system information 13).
//
//   13  1 byte, not read
//   14  u8  position
struct GPRSSI13Packet {
    static constexpr LogCode kCode = 0x51F4;

    enum class Position : std::uint8_t { bcch = 0, extendedBCCH = 1, notAvailable = 255 };

    Position position = Position::notAvailable;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
