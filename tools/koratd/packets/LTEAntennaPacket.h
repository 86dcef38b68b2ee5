#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// What the broadcast channel says about the antennas of the LTE serving cell.
//
//   20  u8  number of transmit antennas
//   The other bytes up to 22 are not read.
struct LTEAntennaPacket {
    static constexpr LogCode kCode = 0xB0C1;

    int transmitAntennas = 1;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
