#pragma once

#include <QBasicTimer>
#include <QWidget>

namespace orvex {

// The thin bar at the right edge that shows, for a moment after each scrolling, where in the list one is.
class ScrollIndicator final : public QWidget {
public:
    explicit ScrollIndicator(QWidget* parent);

    // Lengths in pixels. Nothing is shown when the whole content is in view.
    void flash(int offset, int contentHeight, const QRect& view);

protected:
    void paintEvent(QPaintEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    QBasicTimer _rest;
};

} // namespace orvex
