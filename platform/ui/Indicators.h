#pragma once

#include <QBasicTimer>
#include <QWidget>

namespace orvex {

// A small spinner. Hidden while stopped, and until it has a parent: without one it would be a window. Its
// timer runs only while it is visible.
class ActivityIndicator final : public QWidget {
public:
    explicit ActivityIndicator(QWidget* parent = nullptr);

    void startAnimating();
    void stopAnimating();
    bool isAnimating() const { return _isAnimating; }
    bool isTicking() const { return _ticks.isActive(); }

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override { return sizeHint(); }

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    void updateVisibility();

    bool _isAnimating = false;
    QBasicTimer _ticks;
};

// The thin bar at the right edge that shows the scroll position for a moment after each change.
class ScrollIndicator final : public QWidget {
public:
    explicit ScrollIndicator(QWidget* parent);

    // In pixels. Shows nothing when the whole content is in view.
    void flash(int offset, int contentHeight, const QRect& view);

protected:
    void paintEvent(QPaintEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    QBasicTimer _rest;
};

} // namespace orvex
