#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// The WCDMA cell that the handset is served by.
//
//   13  u32  uplink UARFCN
//   17  u32  downlink UARFCN
//   21  u32  cell identity: RNC << 16 | cell
//   25  u16  URA identity
//   27  2 bytes, not read
struct WCDMAServingCellPacket {
    static constexpr LogCode kCode = 0x4127;

    int uplinkUARFCN = 0;
    int downlinkUARFCN = 0;
    int cellIdentity = 0;
    int uraID = 0;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
