#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// The GSM cells that a handset on UTRAN measures.
//
//   16     u8  n, number of neighbours
//   17+8i  neighbour i:
//            0  bits 0-13 cell identity, bit 14 band indicator, bit 15 BSIC valid
//            2  u8   network colour code
//            3  u8   base station colour code
//            4  u16  ARFCN
//            6  s16  RSSI, dBm
struct UTRANGSMNeighborPacket {
    static constexpr LogCode kCode = 0xD00E;
    static constexpr std::size_t kLargestCount = 255;

    struct Neighbor {
        int cellID = 0;
        bool isPCS1900 = false; // what the band indicator tells: ARFCNs 512 to 810 exist twice
        bool isBSICValid = false;
        int networkColorCode = 0;
        int baseStationColorCode = 0;
        int arfcn = 0;
        double rssi = 0; // dBm
    };

    std::vector<Neighbor> neighbors;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
