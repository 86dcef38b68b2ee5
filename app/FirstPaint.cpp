#include "FirstPaint.h"

#include <QApplication>
#include <QEvent>

#include <utility>

namespace orvex {

FirstPaint::FirstPaint(std::function<void()> onPainted)
    : _onPainted(std::move(onPainted))
{
    // Of all widgets: a window that is covered by its children is never asked to paint itself.
    qApp->installEventFilter(this);
}

bool FirstPaint::eventFilter(QObject*, QEvent* event)
{
    // All widgets paint in one turn of the event loop, which ends with what they painted on the screen.
    if (event->type() == QEvent::Paint && _onPainted)
        QMetaObject::invokeMethod(this, std::exchange(_onPainted, {}), Qt::QueuedConnection);
    return false;
}

} // namespace orvex
