#pragma once

#include <QAbstractButton>

namespace orvex {

// An invisible background that tells of a touch beside the widgets it holds: pressed().
class TouchArea final : public QAbstractButton {
public:
    explicit TouchArea(QWidget* parent);

protected:
    void paintEvent(QPaintEvent*) override { }
    // Keys that its widgets leave over are the screen's.
    void keyPressEvent(QKeyEvent* event) override { QWidget::keyPressEvent(event); }
    void keyReleaseEvent(QKeyEvent* event) override { QWidget::keyReleaseEvent(event); }
};

} // namespace orvex
