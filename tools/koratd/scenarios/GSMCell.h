#pragma once

namespace orvex::korat {

struct GSMCell {
    int arfcn = 0; // of the carrier with the broadcast channel
    int networkColorCode = 0;
    int baseStationColorCode = 0;
    int cellID = 0;

    // The base station identity code, as it is broadcast.
    int bsic() const { return networkColorCode << 3 | baseStationColorCode; }
};

} // namespace orvex::korat
