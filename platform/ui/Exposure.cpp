#include "Exposure.h"

#include <QEvent>
#include <QWindow>

#include <utility>

namespace orvex {

Exposure::Exposure(QWidget& window, std::function<void()> onSeen)
    : QObject(&window)
    , _window(window)
    , _onSeen(std::move(onSeen))
    , _cover(window.winId(), // makes the native window, which gets the events
          [this](bool isCovered) { setCovered(isCovered); })
{
    window.windowHandle()->installEventFilter(this);
}

bool Exposure::eventFilter(QObject*, QEvent* event)
{
    if (event->type() == QEvent::Expose || event->type() == QEvent::WindowStateChange)
        update();
    return false;
}

void Exposure::setCovered(bool isCovered)
{
    _isCovered = isCovered;
    if (isCovered)
        _window.setUpdatesEnabled(false); // Qt goes on painting what it could show
    update();
}

void Exposure::update()
{
    const bool isSeen = _window.windowHandle()->isExposed() && !_window.isMinimized() && !_isCovered;
    if (std::exchange(_isSeen, isSeen) || !isSeen)
        return;
    const auto show = [this] {
        if (!_isSeen)
            return;
        _onSeen();
        if (_window.updatesEnabled())
            return;
        _window.setUpdatesEnabled(true);
        // Not left to Qt, which waits for more if the window still had to be painted when it was covered.
        _window.repaint();
    };
    QMetaObject::invokeMethod(this, show, Qt::QueuedConnection);
}

} // namespace orvex
