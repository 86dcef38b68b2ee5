#pragma once

#include "TableCell.h"

#include <QBasicTimer>
#include <QPointF>
#include <QWidget>

#include <deque>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string_view>
#include <vector>

namespace orvex {

// Cells out of view, ready for reuse: first in, first out for each identifier.
class CellReuseQueue {
public:
    void append(std::unique_ptr<TableCell> cell);
    // Puts the cells before all others, in their order.
    void prepend(std::vector<std::unique_ptr<TableCell>> cells);
    // Null when there is no cell with the identifier.
    std::unique_ptr<TableCell> take(std::string_view identifier);

    void hideAll();
    std::size_t size() const { return _cells.size(); }

private:
    std::deque<std::unique_ptr<TableCell>> _cells;
};

// Follows one finger or mouse button from press to release: tells a tap from a drag, and keeps a drag to the
// axis in which it began.
class TableDrag {
public:
    enum class Axis { undecided, vertical, horizontal };

    TableDrag(const QPointF& start, bool stoppedAFlick)
        : _start(start)
        , _fed(start)
        , _stoppedAFlick(stoppedAFlick)
    {
    }

    // Returns true once the drag is under way.
    bool moveTo(const QPointF& position);

    Axis axis() const { return _axis; }
    const QPointF& start() const { return _start; }
    // The position for scrolling: on the axis, and less the distance it took to become a drag, so that the
    // content does not jump.
    const QPointF& scrollPosition() const { return _fed; }
    // A press that stopped a flick is not a tap.
    bool isTap() const { return _axis == Axis::undecided && !_stoppedAFlick; }

private:
    QPointF _start;
    QPointF _fed;
    double _slack = 0; // signed distance it took to become a drag
    Axis _axis = Axis::undecided;
    bool _stoppedAFlick;
};

class ScrollIndicator;

// A list of rows of one height. Only rows in view have cells; a cell that leaves the view is reused for the
// next row that asks for its identifier. A reload gives every row its own cell again, as long as rows and
// scroll position are the same.
//
// A gesture of a finger or mouse button scrolls either the list or, sideways, the row it began on. Up, down,
// page up, page down, home and end move the selection, enter opens it, left and right scroll it sideways.
class TableList final : public QWidget {
public:
    class DataSource {
    public:
        virtual ~DataSource() = default;

        virtual int numberOfRows(const TableList& list) const = 0;
        // A cell from dequeueReusableCell() or a new one, filled in for the row.
        virtual std::unique_ptr<TableCell> cellForRow(TableList& list, int row) = 0;
        // The row was tapped or opened by key and is now selected; absent after a tap below the last row.
        virtual void didSelectRow(TableList& list, std::optional<int> row) = 0;
        // A long press, a right click or the menu key asked for the menu of a row; absent below the last.
        virtual void wantsMenu(TableList& /*list*/, std::optional<int> /*row*/, const QPoint& /*globalPlace*/)
        {
        }
    };

    static constexpr int kDefaultRowHeight = 44;

    // Empty until it has a source.
    explicit TableList(QWidget* parent);
    TableList(DataSource& source, QWidget* parent);
    ~TableList() override;

    // Not owned.
    void setDataSource(DataSource& source);

    // Null when there is no cell with the identifier to reuse.
    std::unique_ptr<TableCell> dequeueReusableCell(std::string_view identifier);
    // Maps a row before a reload to the row after it; absent when it is gone.
    using RowMove = std::function<std::optional<int>(int row)>;

    // Asks the source for everything again. Keeps the scroll position as far as it still exists, and moves
    // the selected and the pressed row, which by default stay.
    void reloadData(const RowMove& move = {});

    // Tall enough for all rows.
    QSize sizeHint() const override { return {0, _rowCount * _rowHeight}; }

    int rowCount() const { return _rowCount; }
    int rowHeight() const { return _rowHeight; }
    void setRowHeight(int height);
    // Null when the row is out of view.
    TableCell* cellAtRow(int row) const;
    // Absent below the last row.
    std::optional<int> rowAt(const QPointF& position) const;

    std::optional<int> selectedRow() const { return _selectedRow; }
    // The selected row, else the one that was last; absent before the first.
    std::optional<int> currentRow() const { return _selectedRow ? _selectedRow : _lastSelectedRow; }
    void selectRow(int row);
    void deselectRow();

    int contentOffset() const { return _offset; }
    int maximumOffset() const { return qMax(0, _rowCount * _rowHeight - height()); }
    // Clamped to the content. The overshoot is how far a finger has pulled beyond the end; it is only shown.
    void setContentOffset(int offset, int overshoot = 0);
    void scrollToRow(int row);

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override { mousePressEvent(event); }
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    void layoutRows();
    void showCell(int row);
    void updateHighlights();
    void setPressedRow(std::optional<int> row);
    std::optional<int> rowAfterKey(int key) const;
    bool scrollSideways(int row, int distance);
    SidewaysScrollView* sidewaysViewAtRow(std::optional<int> row) const;

    DataSource* _source = nullptr;
    int _rowHeight = kDefaultRowHeight;
    int _rowCount = 0;
    int _offset = 0;
    int _overshoot = 0;

    std::map<int, std::unique_ptr<TableCell>> _cells; // in view, by row
    CellReuseQueue _reusable;
    ScrollIndicator* _indicator;

    std::optional<int> _selectedRow;
    std::optional<int> _lastSelectedRow; // where keys continue after a deselection
    std::optional<int> _pressedRow;
    std::optional<int> _gestureRow; // the row a gesture scrolls sideways
    std::optional<TableDrag> _drag;
    QBasicTimer _longPress;
};

} // namespace orvex
