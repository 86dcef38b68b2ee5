#pragma once

#include "CellSelector.h"
#include "RadioField.h"
#include "Randomness.h"

#include <optional>
#include <vector>

namespace orvex::korat {

struct LTECarrier {
    int earfcn = 0;
    int band = 0;
    int resourceBlocks = 0;
    int priority = 0;

    // The uplink channel of a pair lies 18000 numbers above.
    int uplinkEARFCN() const { return earfcn + 18000; }
};

struct LTECell {
    const LTECarrier* carrier = nullptr;
    int physicalCellID = 0;
    int cellIdentity = 0;
    int trackingAreaCode = 0;
    int transmitAntennas = 1;
};

// The LTE cells along a road through a town, and how a handset hears them. Two tracking areas; wide cells in
// band 20 outside, bands 3 and 7 inside, a market place full of small cells in the middle, and an underpass
// with a cell of its own, where nothing else is heard.
class LTETown {
public:
    static constexpr double kRoadLength = 4200; // m

    struct Heard {
        const LTECell* cell = nullptr;
        double rsrp = 0;        // dBm
        double averageRSRP = 0; // dBm
        double rsrq = 0;        // dB
        double averageRSRQ = 0; // dB
        double rssi = 0;        // dBm, over the carrier's whole width
    };

    LTETown();

    // Moves the handset; true when another cell serves it now.
    bool step(double position, Randomness& randomness);

    Heard serving() const { return heard(_selector.serving()); }
    // The other cells of a carrier within bounds of their level in dBm, strongest first.
    std::vector<Heard> othersOn(const LTECarrier& carrier, double weakest, double strongest) const;

    static const std::vector<LTECarrier>& carriers();

private:
    struct Plan;

    explicit LTETown(Plan plan);

    Heard heard(std::size_t cell) const;
    double rsrq(std::size_t cell) const;
    void listen();

    std::vector<LTECell> _cells;
    RadioField _field; // a transmitter for each cell
    CellSelector _selector;
    std::vector<double> _received;    // by carrier: power of all its cells together, mW in a resource element
    std::vector<double> _averageRSRQ; // by cell, dB
};

} // namespace orvex::korat
