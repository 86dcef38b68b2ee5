#pragma once

#include "RadioField.h"

#include <algorithm>
#include <vector>

namespace orvex::korat {

template <typename Cell>
struct Heard {
    const Cell* cell = nullptr;
    double level = 0; // dBm: RSCP, or the GSM carrier's strength
};

// The cells of a field, a transmitter for each, that are at least that strong in dBm, strongest first.
template <typename Cell>
std::vector<Heard<Cell>> heardCells(const std::vector<Cell>& cells, const RadioField& field, double weakest)
{
    std::vector<Heard<Cell>> result;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        if (field.level(i) >= weakest)
            result.push_back({&cells[i], field.level(i)});
    }
    std::sort(result.begin(), result.end(), [](const auto& a, const auto& b) { return a.level > b.level; });
    return result;
}

} // namespace orvex::korat
