#pragma once

#include "LogMessage.h"

#include <optional>

namespace orvex::korat {

// The state of the EV-DO receiver.
//
//   13  bits 0-10 channel, 11-15 band class
//   15  s8   receive AGC of antenna 0, dBm
//   16  s8   receive AGC of antenna 1, dBm
//   17  s8   transmit AGC, dBm
//   18  u16  PN offset of the serving pilot, 65535 is none
//   36  u8   device state
//   37  u8   session state
//   38  u24  lower bits of the terminal's identifier (UATI)
//   41  u8   colour code of the subnet that has assigned it
//
// Antenna 1 and the transmitter are on from access on; before, their bytes mean nothing.
struct C2KEVDOStatusPacket {
    static constexpr LogCode kCode = 0x1183;

    enum class State : std::uint8_t {
        inactive = 0,
        acquisition = 1,
        sync = 2,
        idle = 3,
        access = 4,
        connected = 5
    };
    enum class Session : std::uint8_t {
        closed = 0,
        setup = 1,
        terminalNegotiates = 2,
        networkNegotiates = 3,
        open = 4
    };

    int channel = 0;
    int bandClass = 0;
    double receiveAGC0 = 0; // dBm
    double receiveAGC1 = 0; // dBm
    double transmitAGC = 0; // dBm
    std::optional<int> servingPN;
    State state = State::inactive;
    Session session = Session::closed;
    int uati24 = 0;
    int colorCode = 0;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
