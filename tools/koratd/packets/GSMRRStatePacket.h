#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// What the radio-resource layer of GSM does.
//
//   13  u8  state
//   14  u8  substate
//   15  u8  status
//   16  u8  mode: 0 voice, else data
struct GSMRRStatePacket {
    static constexpr LogCode kCode = 0x512C;

    enum class State : std::uint8_t {
        inactive = 0,
        cellSelection = 3,
        idle = 5,
        cellReselection = 6,
        connectionPending = 7,
        dataTransfer = 9, // of a call's speech too
        noChannels = 10,
        connectionRelease = 11,
        reselectionFromUMTS = 14,
        reselectionToUMTS = 18
    };

    State state = State::inactive;
    int substate = 0;
    int status = 0;
    bool isData = false;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
