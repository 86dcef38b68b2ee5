#pragma once

#include <QPointer>
#include <QWidget>

namespace orvex {

class ToolbarRow;

// The bar at the bottom: shows the row of the screen on top.
class Toolbar final : public QWidget {
public:
    static constexpr int kHeight = 44;

    explicit Toolbar(QWidget* parent);

    // The row stays its screen's; the bar only lends it a place. Null empties the bar. What becomes of the
    // row shown so far is the new one's affair when that replaces it.
    void showRow(ToolbarRow* row, bool replacesShownRow);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void place(QWidget& row) const;

    QPointer<ToolbarRow> _row;
};

} // namespace orvex
