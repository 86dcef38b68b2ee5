#pragma once

#include <QApplication>
#include <QEvent>
#include <QWidget>

namespace orvex::test {

// Counts the paint events of all widgets in a window.
class PaintCounter final : public QObject {
public:
    explicit PaintCounter(const QWidget& window)
        : _window(window)
    {
        qApp->installEventFilter(this);
    }

    bool eventFilter(QObject* watched, QEvent* event) override
    {
        const bool paints = event->type() == QEvent::Paint && watched->isWidgetType();
        count += paints && static_cast<QWidget*>(watched)->window() == &_window ? 1 : 0;
        return false;
    }

    int count = 0;

private:
    const QWidget& _window;
};

} // namespace orvex::test
