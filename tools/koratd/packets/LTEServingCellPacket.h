#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// The LTE cell that the handset is served by.
//
//   13  not read
//   14  u16  physical cell identity
//   16  u16  downlink EARFCN
//   18  u16  uplink EARFCN
//   20  u8   downlink bandwidth, resource blocks
//   21  u8   uplink bandwidth, resource blocks
//   22  s32  cell identity: eNodeB << 8 | sector
//   26  u16  tracking area code
//   28  s32  frequency band
//   32  6 bytes, not read
struct LTEServingCellPacket {
    static constexpr LogCode kCode = 0xB0C2;

    int physicalCellID = 0;
    int downlinkEARFCN = 0;
    int uplinkEARFCN = 0;
    int downlinkResourceBlocks = 0;
    int uplinkResourceBlocks = 0;
    int cellIdentity = 0;
    int trackingAreaCode = 0;
    int band = 0;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
