#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// What a cell broadcasts for packet data, on its own channel (PSI) or on the common one (SI), and how often
// that has changed.
//
//   13  u8  status of the packet system information
//   14  u8  count of changes, low repetition
//   15  u8  count of changes, high repetition
//   16  u8  extended measurement order
//   17  16 bytes, not read
//   33  u8  0 the cell does not tell its SI status, else it does
//   34  1 byte, not read
struct GPRSSystemInformationPacket {
    static constexpr LogCode kCode = 0x51FD;

    int psiStatus = 0;
    int lowRepetitionCount = 0;
    int highRepetitionCount = 0;
    int extendedMeasurementOrder = 0;
    bool supportsSIStatus = false;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
