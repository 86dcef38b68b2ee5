#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// The GSM cell that the handset is served by.
//
//   13  u16  ARFCN
//   15  u16  BSIC
//   17  u16  cell identity
//   19  7 bytes, not read
struct GSMServingCellPacket {
    static constexpr LogCode kCode = 0x5134;

    int arfcn = 0;
    int bsic = 0;
    int cellID = 0;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
