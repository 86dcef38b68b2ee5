#include "Exposure.h"

#include <QEvent>
#include <QWindow>

#include <utility>

namespace orvex {

Exposure::Exposure(QWidget& window, std::function<void()> onSeen)
    : QObject(&window)
    , _window(window)
    , _onSeen(std::move(onSeen))
{
    window.winId(); // makes the native window, which gets the events
    window.windowHandle()->installEventFilter(this);
}

bool Exposure::eventFilter(QObject*, QEvent* event)
{
    if (event->type() != QEvent::Expose && event->type() != QEvent::WindowStateChange)
        return false;
    const bool isSeen = _window.windowHandle()->isExposed() && !_window.isMinimized();
    if (!std::exchange(_isSeen, isSeen) && isSeen)
        QMetaObject::invokeMethod(
            this, [this] { _onSeen(); }, Qt::QueuedConnection);
    return false;
}

} // namespace orvex
