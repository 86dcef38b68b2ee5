#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// Idle mode: the neighbour cells on one frequency.
//
//   13      u8   version
//   17      u16  EARFCN
//   19      bits 0-5 Qrxlevmin, 2 dB from -140 dBm; bits 6-10 number of cells less one
//   21+20i  cell i, a bit string:
//             0-8      physical cell identity
//             9-16     RSSI, 0.5 dB from -140 dBm
//            17-25     RSRP, 0.5 dB from -140 dBm (half the resolution that the serving cell has)
//            32-40     average RSRP, likewise
//            41-47     RSRQ, 0.25 dB from -30 dB
//            48-54     average RSRQ, likewise
//            55-61     Srxlev, 1 dB from -30 dB
//            64-79     frequency offset
//            96-106    frame offset of antenna 0
//           107-125    sample offset of antenna 0
struct LTENeighborMeasurementPacket {
    static constexpr LogCode kCode = 0xB180;
    static constexpr std::size_t kLargestCount = 32;

    struct Cell {
        int physicalCellID = 0;
        double rssi = 0;        // dBm
        double rsrp = 0;        // dBm
        double averageRSRP = 0; // dBm
        double rsrq = 0;        // dB
        double averageRSRQ = 0; // dB
        int sRxLev = 0;         // dB
        int frequencyOffset = 0;
        int frameOffset = 0;
        int sampleOffset = 0;
    };

    int version = 1;
    int earfcn = 0;
    int qRxLevMin = 0; // dBm
    // 1 to 32; a packet without cells cannot be told from one with a single cell and is not sent.
    std::vector<Cell> cells;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
