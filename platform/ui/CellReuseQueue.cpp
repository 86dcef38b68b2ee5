#include "CellReuseQueue.h"

#include <algorithm>
#include <iterator>

namespace orvex {

void CellReuseQueue::append(std::unique_ptr<TableCell> cell)
{
    _cells.push_back(std::move(cell));
}

void CellReuseQueue::prepend(std::vector<std::unique_ptr<TableCell>> cells)
{
    _cells.insert(
        _cells.begin(), std::make_move_iterator(cells.begin()), std::make_move_iterator(cells.end()));
}

std::unique_ptr<TableCell> CellReuseQueue::take(std::string_view identifier)
{
    const auto found = std::ranges::find_if(
        _cells, [identifier](const auto& cell) { return cell->reuseIdentifier() == identifier; });
    if (found == _cells.end())
        return nullptr;
    auto cell = std::move(*found);
    _cells.erase(found);
    return cell;
}

void CellReuseQueue::hideAll()
{
    for (const auto& cell : _cells)
        cell->hide();
}

} // namespace orvex
