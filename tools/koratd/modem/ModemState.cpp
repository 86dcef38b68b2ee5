#include "modem/ModemState.h"

#include <algorithm>

namespace orvex::korat {

const Cell* ModemState::servingCell() const
{
    // Beside an LTE cell, a 5G cell may serve; beside 1x, another of CDMA.
    const auto isNamed = [](const Cell& cell) {
        return cell.isServing && cell.radio != Radio::nr5g && cell.radio != Radio::cdma;
    };
    auto cell = std::ranges::find_if(cells, isNamed);
    if (cell == cells.end())
        cell = std::ranges::find(cells, true, &Cell::isServing);
    return cell == cells.end() ? nullptr : &*cell;
}

} // namespace orvex::korat
