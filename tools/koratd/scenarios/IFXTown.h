#pragma once

#include "CellSelector.h"
#include "RadioField.h"
#include "Randomness.h"

#include "packets/IFXReport.h"

#include <vector>

namespace orvex::korat {

// UMTS cells in a town, and GSM cells there and on the road beyond it. In an underpass there is a GSM cell
// and nothing else. The strongest cell serves, whatever its technology.
class IFXTown {
public:
    static constexpr double kRoadLength = 3600;   // m
    static constexpr double kGSMLevelAt20m = -50; // dBm

    IFXTown();

    // Moves the handset; true when another cell serves it now.
    bool step(double position, Randomness& randomness);

    IFXReport::Cell serving() const { return measured(_selector.serving()); }
    // All other cells at least that strong in dBm, strongest first.
    std::vector<IFXReport::Cell> others(double weakest) const;

private:
    IFXReport::Cell measured(std::size_t cell) const;

    std::vector<IFXReport::Cell> _cells; // without levels
    RadioField _field;                   // a transmitter for each cell
    CellSelector _selector;
};

} // namespace orvex::korat
