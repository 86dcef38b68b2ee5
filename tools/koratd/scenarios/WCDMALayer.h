#pragma once

#include "CellSelector.h"
#include "RadioField.h"
#include "Randomness.h"

#include <vector>

namespace orvex::korat {

struct WCDMACell {
    int uarfcn = 0; // downlink
    int scramblingCode = 0;
    int cellIdentity = 0; // RNC << 16 | cell
    int uraID = 0;
    bool isListed = true; // in the lists that the network broadcasts

    // Band I: the uplink lies 190 MHz below, in steps of 200 kHz.
    int uplinkUARFCN() const { return uarfcn - 950; }
};

// The UMTS cells of the town: wide ones along the road, small ones on a frequency of their own around the
// market place, and one in the underpass, where nothing else is heard.
class WCDMALayer {
public:
    struct Heard {
        const WCDMACell* cell = nullptr;
        double rscp = 0;        // dBm
        double averageRSCP = 0; // dBm
        double ecNo = 0;        // dB
    };

    WCDMALayer();

    // Moves the handset; true when another cell serves it now.
    bool step(double position, Randomness& randomness);

    Heard serving() const { return heard(_selector.serving()); }
    // All other cells whose RSCP is at least that many dBm, strongest first.
    std::vector<Heard> others(double weakest) const;
    // All power on the serving cell's frequency, dBm.
    double rssi() const { return received(*serving().cell); }

private:
    Heard heard(std::size_t cell) const;
    double received(const WCDMACell& cell) const;

    std::vector<WCDMACell> _cells;
    RadioField _field; // a transmitter for each cell
    CellSelector _selector;
    std::vector<double> _received; // by frequency, dBm
};

} // namespace orvex::korat
