#pragma once

#include "LogMessage.h"

#include <optional>

namespace orvex::korat {

// Idle mode: the serving cell's levels and what cell selection makes of them.
//
//   13  u8   version
//   17  u16  EARFCN
//   19  a bit string:
//         0-8      physical cell identity
//         9-12     priority of the serving layer
//        16-24     RSRP, 0.25 dB from -140 dBm
//        25-33     average RSRP, likewise
//        34-40     RSRQ, 0.25 dB from -30 dB
//        41-47     average RSRQ, likewise
//        48-56     RSSI, 0.5 dB from -140 dBm
//        57-62     Qrxlevmin, 2 dB from -140 dBm
//        63-69     P-Max, 1 dB from -30 dBm; 64 is none, so 34 dBm cannot be told
//        70-75     maximum transmit power of the handset, 1 dB from -30 dBm
//        80-86     Srxlev, 1 dB from -30 dB
//        87-92     consecutive DRX cycles with S below 0
//        93-98     S-IntraSearch, 2 dB; 32 is none
//        99-104    S-NonIntraSearch, 2 dB; 32 is none
//       105        measurement rules updated
//       106-109    measurement rules
struct LTEServingMeasurementPacket {
    static constexpr LogCode kCode = 0xB17F;

    int version = 1;
    int earfcn = 0;
    int physicalCellID = 0;
    int layerPriority = 0;
    double rsrp = 0;         // dBm
    double averageRSRP = 0;  // dBm
    double rsrq = 0;         // dB
    double averageRSRQ = 0;  // dB
    double rssi = 0;         // dBm
    int qRxLevMin = 0;       // dBm
    std::optional<int> pMax; // dBm
    int maximumPower = 0;    // dBm
    int sRxLev = 0;          // dB
    int drxCyclesBelowZero = 0;
    std::optional<int> sIntraSearch;    // dB
    std::optional<int> sNonIntraSearch; // dB
    bool rulesUpdated = false;
    int rules = 0;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
