#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// How well the serving GSM cell and its neighbours are heard.
//
//   15      u8   level, dBm without its sign
//   16      u32  idle: C1; in a call: RXQUAL over all frames
//   20      u32  idle: C2; in a call: RXQUAL over the frames that discontinuous transmission leaves
//   26      u8   0 without a hysteresis for reselection between packet-switched cells
//   28      u8   n, number of neighbours
//   29+14i  neighbour i: u16 ARFCN, u8 level as above, s32 C1, 7 bytes not read
//
// The quality fields are unsigned: a C1 below 0 cannot be told of the serving cell, only of a neighbour.
struct GSMMeasurementPacket {
    static constexpr LogCode kCode = 0x5137;
    static constexpr std::size_t kLargestCount = 255;

    struct Neighbor {
        int arfcn = 0;
        double level = 0; // dBm
        int c1 = 0;
    };

    double level = 0; // dBm
    int c1OrQualityFull = 0;
    int c2OrQualitySub = 0;
    bool isHysteresisApplied = false;
    std::vector<Neighbor> neighbors;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
