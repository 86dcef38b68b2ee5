#pragma once

#include "Bar.h"

#include <QPointer>

namespace orvex {

class ToolbarRow;

// The bar at the bottom: shows the row of the screen on top.
class Toolbar final : public Bar {
public:
    explicit Toolbar(QWidget* parent);

    // The row still belongs to its screen. Null empties the bar. Hides the row shown so far, unless that is
    // the one being replaced: its successor decides when it goes.
    void showRow(ToolbarRow* row, const ToolbarRow* replaced = nullptr);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void place(QWidget& row) const;

    QPointer<ToolbarRow> _row;
};

} // namespace orvex
