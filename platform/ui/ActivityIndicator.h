#pragma once

#include <QBasicTimer>
#include <QWidget>

namespace orvex {

// The small spinner. Hidden while stopped, and until it has a parent: alone it would be a window. Its timer
// runs only while there is something to see.
class ActivityIndicator final : public QWidget {
public:
    explicit ActivityIndicator(QWidget* parent = nullptr);

    void startAnimating();
    void stopAnimating();
    bool isAnimating() const { return _isAnimating; }
    // True while the timer runs.
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

} // namespace orvex
