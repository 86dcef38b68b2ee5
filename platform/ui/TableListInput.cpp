// How a table list handles fingers, mouse, wheel and keys.

#include "TableCell.h"
#include "TableList.h"

#include <QApplication>
#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QScrollEvent>
#include <QScroller>
#include <QTimerEvent>
#include <QWheelEvent>

#include <algorithm>
#include <cmath>

namespace orvex {

namespace {
constexpr int kSidewaysKeyStep = 40; // pixels
constexpr int kWheelLine = 20;       // pixels for a line of the wheel setting
constexpr double kWheelNotch = 120;  // angle units in a notch
constexpr int kLongPressMilliseconds = 600;

qint64 millisecondsOf(const QMouseEvent& event)
{
    return static_cast<qint64>(event.timestamp());
}

// In pixels, right and down positive.
QPoint distanceOf(const QWheelEvent& event)
{
    if (!event.pixelDelta().isNull())
        return -event.pixelDelta();
    const double perUnit = QApplication::wheelScrollLines() * kWheelLine / kWheelNotch;
    return (QPointF(event.angleDelta()) * -perUnit).toPoint();
}
} // namespace

// The scroller asks what a gesture can scroll, then where to scroll.
bool TableList::event(QEvent* event)
{
    if (event->type() == QEvent::ScrollPrepare) {
        auto* const prepare = static_cast<QScrollPrepareEvent*>(event);
        _gestureRow = rowAt(prepare->startPos());
        const SidewaysScrollView* const view = sidewaysViewAtRow(_gestureRow);
        prepare->setViewportSize(size());
        prepare->setContentPosRange(QRectF(0, 0, view ? view->maximumOffset() : 0, maximumOffset()));
        prepare->setContentPos(QPointF(view ? view->offset() : 0, _offset));
        prepare->accept();
        return true;
    }
    if (event->type() == QEvent::Scroll) {
        const auto* const scroll = static_cast<QScrollEvent*>(event);
        const QPoint position = scroll->contentPos().toPoint();
        const QPoint overshoot = scroll->overshootDistance().toPoint();
        setContentOffset(position.y(), overshoot.y());
        if (SidewaysScrollView* const view = sidewaysViewAtRow(_gestureRow))
            view->setOffset(position.x(), overshoot.x());
        event->accept();
        return true;
    }
    return QWidget::event(event);
}

void TableList::mousePressEvent(QMouseEvent* event)
{
    if (event->button() != Qt::LeftButton)
        return QWidget::mousePressEvent(event);
    QScroller* const scroller = QScroller::scroller(this);
    const bool stopsFlick = scroller->state() == QScroller::Scrolling;
    _drag.emplace(event->position(), stopsFlick);
    scroller->handleInput(QScroller::InputPress, event->position(), millisecondsOf(*event));
    if (stopsFlick)
        return;
    setPressedRow(rowAt(event->position()));
    _longPress.start(kLongPressMilliseconds, this);
}

void TableList::mouseMoveEvent(QMouseEvent* event)
{
    if (!_drag || !_drag->moveTo(event->position()))
        return;
    _longPress.stop();
    setPressedRow(std::nullopt);
    QScroller::scroller(this)->handleInput(
        QScroller::InputMove, _drag->scrollPosition(), millisecondsOf(*event));
}

void TableList::mouseReleaseEvent(QMouseEvent* event)
{
    if (event->button() != Qt::LeftButton)
        return QWidget::mouseReleaseEvent(event);
    _longPress.stop();
    if (!_drag)
        return;
    _drag->moveTo(event->position());
    const TableDrag drag = *_drag;
    _drag.reset();
    QScroller::scroller(this)->handleInput(
        QScroller::InputRelease, drag.scrollPosition(), millisecondsOf(*event));
    const auto row = _pressedRow; // a reload may have moved it since the press
    setPressedRow(std::nullopt);
    if (!drag.isTap())
        return;
    if (row)
        selectRow(*row);
    if (_source)
        _source->didSelectRow(*this, row);
}

// Ends the press, so that the release, which the menu gets, is no tap.
void TableList::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != _longPress.timerId())
        return QWidget::timerEvent(event);
    _longPress.stop();
    if (!_drag || !_source)
        return;
    const QPointF place = _drag->start();
    _drag.reset();
    QScroller::scroller(this)->handleInput(QScroller::InputRelease, place);
    const auto row = _pressedRow; // a reload may have moved it since the press
    setPressedRow(std::nullopt);
    _source->wantsMenu(*this, row, mapToGlobal(place.toPoint()));
}

void TableList::contextMenuEvent(QContextMenuEvent* event)
{
    if (!_source)
        return;
    const bool byKey = event->reason() == QContextMenuEvent::Keyboard;
    _source->wantsMenu(*this, byKey ? _selectedRow : rowAt(event->pos()), event->globalPos());
}

void TableList::wheelEvent(QWheelEvent* event)
{
    const QPoint distance = distanceOf(*event);
    event->accept();
    if (std::abs(distance.x()) > std::abs(distance.y())) {
        if (const auto row = rowAt(event->position()))
            scrollSideways(*row, distance.x());
        return;
    }
    QScroller::scroller(this)->stop();
    setContentOffset(_offset + distance.y());
}

std::optional<int> TableList::rowAfterKey(int key) const
{
    const int page = std::max(1, height() / _rowHeight - 1);
    const int last = _rowCount - 1;
    const bool hasPlace = _selectedRow || _lastSelectedRow;
    const int place = _selectedRow ? *_selectedRow : _lastSelectedRow.value_or(0);
    switch (key) {
    case Qt::Key_Home: return 0;
    case Qt::Key_End: return last;
    case Qt::Key_Up: return hasPlace ? std::max(0, place - 1) : last;
    case Qt::Key_Down: return hasPlace ? std::min(last, place + 1) : 0;
    case Qt::Key_PageUp: return std::max(0, place - page);
    case Qt::Key_PageDown: return std::min(last, place + page);
    default: return std::nullopt;
    }
}

void TableList::keyPressEvent(QKeyEvent* event)
{
    const int key = event->key();
    if (const auto row = _rowCount > 0 ? rowAfterKey(key) : std::nullopt) {
        scrollToRow(*row);
        return selectRow(*row);
    }
    const bool goesLeft = key == Qt::Key_Left;
    if ((goesLeft || key == Qt::Key_Right) && _selectedRow) {
        scrollSideways(*_selectedRow, goesLeft ? -kSidewaysKeyStep : kSidewaysKeyStep);
        return;
    }
    if ((key == Qt::Key_Return || key == Qt::Key_Enter) && _selectedRow)
        return _source->didSelectRow(*this, _selectedRow);
    QWidget::keyPressEvent(event);
}

} // namespace orvex
