#pragma once

#include <QAbstractButton>

namespace orvex {

// An invisible background that tells of a touch beside the widgets it holds: pressed().
class TouchArea final : public QAbstractButton {
public:
    explicit TouchArea(QWidget* parent);

protected:
    void paintEvent(QPaintEvent*) override { }
    // Keys that its widgets leave over are the screen's, not the button's.
    // NOLINTBEGIN(bugprone-parent-virtual-call)
    void keyPressEvent(QKeyEvent* event) override { QWidget::keyPressEvent(event); }
    void keyReleaseEvent(QKeyEvent* event) override { QWidget::keyReleaseEvent(event); }
    // NOLINTEND(bugprone-parent-virtual-call)
};

} // namespace orvex
