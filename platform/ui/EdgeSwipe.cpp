#include "EdgeSwipe.h"

#include "NavigationStack.h"

#include <QApplication>
#include <QMouseEvent>

#include <cstdlib>

namespace orvex {

namespace {

constexpr int kEdge = 20;       // points from the left in which it begins
constexpr double kShare = 0.25; // of the width, which it crosses at least

bool isSwipe(const QPoint& travel, int width)
{
    return travel.x() >= width * kShare && travel.x() > 2 * std::abs(travel.y());
}

} // namespace

EdgeSwipe::EdgeSwipe(NavigationStack& stack)
    : QObject(&stack)
    , _stack(stack)
{
    qApp->installEventFilter(this);
}

bool EdgeSwipe::eventFilter(QObject* watched, QEvent* event)
{
    const bool isPress = event->type() == QEvent::MouseButtonPress;
    if ((!isPress && event->type() != QEvent::MouseButtonRelease) || !watched->isWidgetType())
        return false;
    const auto* const widget = static_cast<QWidget*>(watched);
    const auto* const mouse = static_cast<QMouseEvent*>(event);
    if (mouse->button() != Qt::LeftButton || !_stack.isAncestorOf(widget))
        return false;
    const QPoint place = widget->mapTo(&_stack, mouse->position().toPoint());
    if (isPress) {
        _start = place.x() < kEdge ? std::optional(place) : std::nullopt;
    } else if (_start && isSwipe(place - *_start, _stack.width())) {
        _start.reset();
        // Later: the list has yet to see the release.
        QMetaObject::invokeMethod(
            &_stack, [&stack = _stack] { stack.pop(true); }, Qt::QueuedConnection);
    }
    return false;
}

} // namespace orvex
