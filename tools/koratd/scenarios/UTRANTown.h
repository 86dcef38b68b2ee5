#pragma once

#include "CellSelector.h"
#include "GSMCell.h"
#include "HeardCells.h"
#include "RadioField.h"
#include "Randomness.h"

#include <vector>

namespace orvex::korat {

struct UTRANCell {
    int uarfcn = 0;
    int cellParameterID = 0; // 0 to 127
    int cellIdentity = 0;    // RNC << 16 | cell
    int locationAreaCode = 0;
    int uraID = 0;
    bool isListed = true; // in the lists that the network broadcasts
    bool isBarred = false;
};

// The UTRAN cells (in the unpaired band 34, one frequency for both directions) and GSM cells along a road
// through a town. An underpass has a cell of its own, where nothing else is heard.
class UTRANTown {
public:
    static constexpr double kRoadLength = 3600; // m

    UTRANTown();

    // Moves the handset; true when another UTRAN cell serves it now.
    bool step(double position, Randomness& randomness);

    Heard<UTRANCell> serving() const;
    // All other cells at least that strong in dBm, strongest first.
    std::vector<Heard<UTRANCell>> others(double weakest) const;
    std::vector<Heard<GSMCell>> gsmCells(double weakest) const;

private:
    std::vector<UTRANCell> _cells;
    RadioField _field; // a transmitter for each cell
    CellSelector _selector;
    std::vector<GSMCell> _gsmCells;
    RadioField _gsmField;
};

} // namespace orvex::korat
