#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// The RRC state of a handset on UMTS.
//
//   13  u8  state
struct WCDMARRCStatePacket {
    static constexpr LogCode kCode = 0x4125;

    enum class State : std::uint8_t {
        disconnected = 0,
        connecting = 1,
        cellFACH = 2,
        cellDCH = 3,
        cellPCH = 4,
        uraPCH = 5
    };

    State state = State::disconnected;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
