#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// Mobility management of the circuit-switched side.
//
//   13  u8  state
//   14  u8  substate
//   15  u8  update status
struct MMStatePacket {
    static constexpr LogCode kCode = 0x7131;

    enum class State : std::uint8_t {
        null = 0,
        locationUpdateInitiated = 3,
        waitForOutgoingConnection = 5,
        connectionActive = 6,
        imsiDetachInitiated = 7,
        waitForNetworkCommand = 9,
        locationUpdateRejected = 10,
        waitForRRConnectionForUpdate = 13,
        waitForRRConnection = 14,
        idle = 19
    };
    enum class Substate : std::uint8_t {
        nullSubstate = 0,
        plmnSearch = 2,
        limitedService = 3,
        attemptingToUpdate = 4,
        locationUpdateNeeded = 5,
        noCellAvailable = 6,
        normalService = 8
    };
    enum class Update : std::uint8_t {
        updated = 0,
        notUpdated = 1,
        roamingNotAllowed = 2,
        areaNotAllowed = 3
    };

    State state = State::null;
    Substate substate = Substate::nullSubstate;
    Update update = Update::notUpdated;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
