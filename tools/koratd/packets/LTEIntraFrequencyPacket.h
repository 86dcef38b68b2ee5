#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// Connected mode: the serving cell and the cells on its frequency, filtered.
//
//   17        u16  EARFCN
//   19        u16  physical cell identity of the serving cell
//   21        u16  subframe number
//   23        u16  its RSRP, 0.25 dB from -140 dBm
//   25        u16  its RSRQ, 0.125 dB from -20 dB
//   27        u8   n, number of measured neighbours
//   28        u8   m, number of detected cells
//   29+6i     measured neighbour i: u16 physical cell identity, u16 RSRP, u16 RSRQ
//   29+6n+2j  detected cell j: u16 physical cell identity
struct LTEIntraFrequencyPacket {
    static constexpr LogCode kCode = 0xB179;

    struct Neighbor {
        int physicalCellID = 0;
        double rsrp = 0; // dBm
        double rsrq = 0; // dB
    };

    int earfcn = 0;
    int physicalCellID = 0;
    int subframe = 0;
    double rsrp = 0;                 // dBm
    double rsrq = 0;                 // dB
    std::vector<Neighbor> neighbors; // at most 255
    std::vector<int> detectedCells;  // physical cell identities, at most 255

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
