#pragma once

#include "CellSelector.h"
#include "GSMCell.h"
#include "HeardCells.h"
#include "RadioField.h"
#include "Randomness.h"

#include <vector>

namespace orvex::korat {

// The GSM cells of the town: wide ones along the road, small ones around the market place, and one in the
// underpass, where nothing else is heard.
class GSMLayer {
public:
    GSMLayer();

    // Moves the handset; true when another cell serves it now.
    bool step(double position, Randomness& randomness);

    Heard<GSMCell> serving() const;
    // All other cells at least that strong in dBm, strongest first.
    std::vector<Heard<GSMCell>> others(double weakest) const;

private:
    std::vector<GSMCell> _cells;
    RadioField _field; // a transmitter for each cell
    CellSelector _selector;
};

} // namespace orvex::korat
