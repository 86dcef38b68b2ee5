#include "TableList.h"

#include "Indicators.h"
#include "TableCell.h"
#include "Theme.h"

#include <QGuiApplication>
#include <QPaintEvent>
#include <QPainter>
#include <QScroller>
#include <QStyleHints>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <vector>

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

bool TableDrag::moveTo(const QPointF& position)
{
    const QPointF travel = position - _start;
    if (_axis == Axis::undecided) {
        const double slop = QGuiApplication::styleHints()->startDragDistance();
        if (travel.manhattanLength() < slop)
            return false;
        _axis = std::abs(travel.x()) > std::abs(travel.y()) ? Axis::horizontal : Axis::vertical;
        const double along = _axis == Axis::horizontal ? travel.x() : travel.y();
        _slack = std::clamp(along, -slop, slop);
    }
    _fed = _axis == Axis::horizontal ? _start + QPointF(travel.x() - _slack, 0)
                                     : _start + QPointF(0, travel.y() - _slack);
    return true;
}

TableList::TableList(DataSource& source, QWidget* parent)
    : TableList(parent)
{
    _source = &source;
}

TableList::TableList(QWidget* parent)
    : QWidget(parent)
    , _indicator(new ScrollIndicator(this))
{
    setAttribute(Qt::WA_OpaquePaintEvent);
    setFocusPolicy(Qt::StrongFocus);
    // The list itself decides when a press has become a drag.
    QScroller* const scroller = QScroller::scroller(this);
    QScrollerProperties properties = scroller->scrollerProperties();
    properties.setScrollMetric(QScrollerProperties::DragStartDistance, 0.0);
    scroller->setScrollerProperties(properties);
}

TableList::~TableList() = default;

void TableList::setDataSource(DataSource& source)
{
    _source = &source;
    reloadData();
}

std::unique_ptr<TableCell> TableList::dequeueReusableCell(std::string_view identifier)
{
    return _reusable.take(identifier);
}

void TableList::reloadData(const RowMove& move)
{
    _rowCount = _source ? _source->numberOfRows(*this) : 0;
    updateGeometry();
    // Ahead of other cells to reuse, so that each row gets its own.
    std::vector<std::unique_ptr<TableCell>> inView;
    for (auto& [row, cell] : _cells)
        inView.push_back(std::move(cell));
    _cells.clear();
    _reusable.prepend(std::move(inView));

    for (auto* row : {&_selectedRow, &_pressedRow}) {
        if (*row && move)
            *row = move(**row);
    }
    if (_selectedRow)
        _lastSelectedRow = _selectedRow;
    for (auto* row : {&_selectedRow, &_lastSelectedRow, &_pressedRow}) {
        if (*row && **row >= _rowCount)
            row->reset();
    }
    setContentOffset(_offset, _overshoot);
    if (QScroller::scroller(this)->state() == QScroller::Scrolling)
        QScroller::scroller(this)->resendPrepareEvent(); // the content's end may have moved
    update();
}

void TableList::setRowHeight(int height)
{
    _rowHeight = height;
    reloadData();
}

TableCell* TableList::cellAtRow(int row) const
{
    const auto found = _cells.find(row);
    return found == _cells.end() ? nullptr : found->second.get();
}

std::optional<int> TableList::rowAt(const QPointF& position) const
{
    const double y = position.y() + _offset + _overshoot;
    if (y < 0 || y >= static_cast<double>(_rowCount) * _rowHeight)
        return std::nullopt;
    return static_cast<int>(y) / _rowHeight;
}

void TableList::setContentOffset(int offset, int overshoot)
{
    const int former = _offset + _overshoot;
    _offset = std::clamp(offset, 0, maximumOffset());
    _overshoot = overshoot;
    layoutRows();
    if (_offset + _overshoot != former)
        _indicator->flash(_offset, _rowCount * _rowHeight, rect());
}

void TableList::layoutRows()
{
    const int top = _offset + _overshoot;
    const int first = std::clamp(top / _rowHeight, 0, _rowCount);
    const int end = std::clamp((top + height() + _rowHeight - 1) / _rowHeight, first, _rowCount);

    // Cells that leave first, so that rows that enter can reuse them.
    for (auto it = _cells.begin(); it != _cells.end();) {
        if (it->first >= first && it->first < end) {
            ++it;
            continue;
        }
        _reusable.append(std::move(it->second));
        it = _cells.erase(it);
    }
    for (int row = first; row < end; ++row) {
        if (!_cells.contains(row))
            showCell(row);
        _cells[row]->setGeometry(0, row * _rowHeight - top, width(), _rowHeight);
    }
    _reusable.hideAll();
}

void TableList::showCell(int row)
{
    std::unique_ptr<TableCell> cell = _source->cellForRow(*this, row);
    if (cell->_row != row && cell->sidewaysScrollView())
        cell->sidewaysScrollView()->setOffset(0);
    cell->_row = row;
    if (cell->parentWidget() != this)
        cell->setParent(this);
    cell->setHighlighted(row == _selectedRow || row == _pressedRow);
    cell->setVisible(true);
    _cells[row] = std::move(cell);
}

void TableList::updateHighlights()
{
    for (const auto& [row, cell] : _cells)
        cell->setHighlighted(row == _selectedRow || row == _pressedRow);
}

void TableList::selectRow(int row)
{
    if (row < 0 || row >= _rowCount)
        return;
    _selectedRow = row;
    _lastSelectedRow = row;
    updateHighlights();
}

void TableList::deselectRow()
{
    _selectedRow.reset();
    updateHighlights();
}

void TableList::setPressedRow(std::optional<int> row)
{
    _pressedRow = row;
    updateHighlights();
}

void TableList::scrollToRow(int row)
{
    QScroller::scroller(this)->stop();
    const int top = row * _rowHeight;
    setContentOffset(
        std::clamp(_offset, top + _rowHeight - height(), std::max(top, top + _rowHeight - height())));
}

SidewaysScrollView* TableList::sidewaysViewAtRow(std::optional<int> row) const
{
    const TableCell* const cell = row ? cellAtRow(*row) : nullptr;
    return cell ? cell->sidewaysScrollView() : nullptr;
}

bool TableList::scrollSideways(int row, int distance)
{
    SidewaysScrollView* const view = sidewaysViewAtRow(row);
    if (!view || view->maximumOffset() == 0)
        return false;
    view->setOffset(view->offset() + distance);
    return true;
}

void TableList::paintEvent(QPaintEvent* event)
{
    QPainter(this).fillRect(event->rect(), Theme::current().background);
}

void TableList::resizeEvent(QResizeEvent*)
{
    QScroller::scroller(this)->stop();
    setContentOffset(_offset);
}

} // namespace orvex
