#pragma once

#include "CellReuseQueue.h"
#include "TableCell.h"
#include "TableDrag.h"

#include <QWidget>

#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string_view>

namespace orvex {

class ScrollIndicator;

// A list of rows of one height. Only the rows in view have cells; a cell that goes out of view is handed to
// the next row that asks for its identifier. A reload hands every row the cell it already has, as long as
// rows and scroll position stand still.
//
// One gesture, of a finger or of a mouse button, scrolls either the list or, sideways, the row it began on.
// Keys: up, down, page up, page down, home and end move the selection, enter opens it, left and right scroll
// it sideways.
class TableList final : public QWidget {
public:
    class DataSource {
    public:
        virtual ~DataSource() = default;

        virtual int numberOfRows(const TableList& list) const = 0;
        // A cell from dequeueReusableCell() or a new one, made up for the row.
        virtual std::unique_ptr<TableCell> cellForRow(TableList& list, int row) = 0;
        // A row was tapped or opened by key; it is selected. None: nothing to open.
        virtual void didSelectRow(TableList& list, std::optional<int> row) = 0;
    };

    static constexpr int kDefaultRowHeight = 44;

    // Empty until it has a source.
    explicit TableList(QWidget* parent);
    TableList(DataSource& source, QWidget* parent);
    ~TableList() override;

    // Held by address.
    void setDataSource(DataSource& source);

    // Null when no cell with the identifier waits for reuse.
    std::unique_ptr<TableCell> dequeueReusableCell(std::string_view identifier);
    // Where a row of before a reload is now; none where it is gone.
    using RowMove = std::function<std::optional<int>(int row)>;

    // Asks for everything anew. Keeps the scroll position as far as it still exists, and the selected and the
    // pressed row where the move says they are: by default where they were.
    void reloadData(const RowMove& move = {});

    // High enough for all rows.
    QSize sizeHint() const override { return {0, _rowCount * _rowHeight}; }

    int rowCount() const { return _rowCount; }
    int rowHeight() const { return _rowHeight; }
    void setRowHeight(int height);
    // Null for a row out of view.
    TableCell* cellAtRow(int row) const;
    // None below the last row.
    std::optional<int> rowAt(const QPointF& position) const;

    std::optional<int> selectedRow() const { return _selectedRow; }
    void selectRow(int row);
    void deselectRow();

    int contentOffset() const { return _offset; }
    int maximumOffset() const { return qMax(0, _rowCount * _rowHeight - height()); }
    // Kept within the content. The overshoot is how far a finger has pulled beyond the end, for show only.
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
    std::optional<int> _lastSelectedRow; // where the keys go on from after a deselection
    std::optional<int> _pressedRow;
    std::optional<int> _gestureRow; // the row a gesture scrolls sideways
    std::optional<TableDrag> _drag;
};

} // namespace orvex
