#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// The UTRAN cell that the handset is served by.
//
//   14  u8   cell access restrictions
//   15  u8   URA identity
//   17  u16  uplink UARFCN
//   19  u16  downlink UARFCN
//   21  s32  cell identity: RNC << 16 | cell
//   25  bit 0: only emergency calls are allowed
struct UTRANServingCellPacket {
    static constexpr LogCode kCode = 0xD0E2;

    int accessRestrictions = 0;
    int uraID = 0;
    int uplinkUARFCN = 0;
    int downlinkUARFCN = 0;
    int cellIdentity = 0;
    bool emergencyCallsOnly = false;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
