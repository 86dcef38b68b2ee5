#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// The cells that a handset on UMTS may move to, UMTS and GSM ones, as it ranks them.
//
//   13      u8  u, number of UMTS cells
//   14      u8  g, number of GSM cells
//   15+10i  UMTS cell i:
//             0  u16  downlink UARFCN
//             2  u16  primary scrambling code
//             4  s8   RSCP + 21, dBm
//             5  s16  RSCP that the rank is computed from, dBm
//             7  s8   Ec/No in half dB
//             8  s16  rank
//   15+7i   GSM cell i:
//             0  u16  ARFCN
//             2  u16  BSIC
//             4  s8   RSSI, dBm
//             5  s16  rank
//
// Both lists start at byte 15. One of them should be empty: where both are not, the GSM cells win.
struct WCDMARankingPacket {
    static constexpr LogCode kCode = 0x4005;
    static constexpr std::size_t kLargestCount = 255; // of each list

    struct UMTSNeighbor {
        int uarfcn = 0;
        int scramblingCode = 0;
        double rscp = 0;        // dBm
        double rankingRSCP = 0; // dBm
        double ecNo = 0;        // dB
        int rank = 0;
    };
    struct GSMNeighbor {
        int arfcn = 0;
        int bsic = 0;
        double rssi = 0; // dBm
        int rank = 0;
    };

    std::vector<UMTSNeighbor> umtsNeighbors;
    std::vector<GSMNeighbor> gsmNeighbors;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
