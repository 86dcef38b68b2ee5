#pragma once

#include "LogMessage.h"

#include <optional>

namespace orvex::korat {

// The RRC state of the handset.
//
//   13  u8  1 when the state is valid
//   14  u8  state
struct UTRANRRCStatePacket {
    static constexpr LogCode kCode = 0xD0E0;

    enum class State : std::uint8_t {
        disconnected = 0,
        connecting = 1,
        cellFACH = 2,
        cellDCH = 3,
        cellPCH = 4,
        uraPCH = 5
    };

    std::optional<State> state; // none: not known yet

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
