#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// Mobility management of the packet-switched side.
//
//   13  u8  state
//   14  u8  substate
//   15  u8  update status
struct GMMStatePacket {
    static constexpr LogCode kCode = 0x7130;

    enum class State : std::uint8_t {
        null = 0,
        deregistered = 1,
        registeredInitiated = 2,
        registered = 3,
        deregisteredInitiated = 4,
        routingAreaUpdateInitiated = 5,
        serviceRequestInitiated = 6
    };
    enum class Substate : std::uint8_t {
        normalService = 0,
        limitedService = 1,
        attachNeeded = 2,
        attemptingToAttach = 3,
        noCellAvailable = 5,
        plmnSearch = 6,
        suspended = 7, // while a call goes on
        updateNeeded = 8,
        nullSubstate = 12
    };
    enum class Update : std::uint8_t { updated = 0, notUpdated = 1, plmnNotAllowed = 2, areaNotAllowed = 3 };

    State state = State::null;
    Substate substate = Substate::nullSubstate;
    Update update = Update::notUpdated;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
