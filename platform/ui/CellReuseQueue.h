#pragma once

#include "TableCell.h"

#include <deque>
#include <memory>
#include <string_view>
#include <vector>

namespace orvex {

// Cells that are out of view, waiting to be shown again: first in, first out for each identifier.
class CellReuseQueue {
public:
    void append(std::unique_ptr<TableCell> cell);
    // Puts cells before all others, in their order.
    void prepend(std::vector<std::unique_ptr<TableCell>> cells);
    // Null when no cell with the identifier waits.
    std::unique_ptr<TableCell> take(std::string_view identifier);

    void hideAll();
    std::size_t size() const { return _cells.size(); }

private:
    std::deque<std::unique_ptr<TableCell>> _cells;
};

} // namespace orvex
