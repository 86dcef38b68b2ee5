#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// How far the handset is registered, and who chooses the network.
//
//   13  u8  registration state
//   14  u8  network selection
//   15  1 byte, not read
struct RegistrationPacket {
    static constexpr LogCode kCode = 0x7132;

    enum class State : std::uint8_t {
        inactive = 0,
        idle = 1,
        registering = 2,
        deregistering = 3,
        manualSearch = 4,
        automaticSearch = 5,
        offline = 6
    };
    enum class Selection : std::uint8_t { automatic = 0, manual = 1, limited = 2 };

    State state = State::inactive;
    Selection selection = Selection::automatic;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
