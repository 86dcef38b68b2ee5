#pragma once

#include <QPointF>

namespace orvex {

// Follows one finger or mouse button from press to release: tells a tap from a drag, and holds a drag to the
// axis in which it began.
class TableDrag {
public:
    enum class Axis { undecided, vertical, horizontal };

    TableDrag(const QPointF& start, bool stoppedAFlick)
        : _start(start)
        , _fed(start)
        , _stoppedAFlick(stoppedAFlick)
    {
    }

    // Returns true once the drag is under way.
    bool moveTo(const QPointF& position);

    Axis axis() const { return _axis; }
    const QPointF& start() const { return _start; }
    // Where the finger is as far as scrolling is concerned: on the axis, and without the first stretch that
    // it took to become a drag, so that the content does not jump.
    const QPointF& scrollPosition() const { return _fed; }
    // A press that only brought a flick to rest opens nothing.
    bool isTap() const { return _axis == Axis::undecided && !_stoppedAFlick; }

private:
    QPointF _start;
    QPointF _fed;
    double _slack = 0; // signed length of the first stretch
    Axis _axis = Axis::undecided;
    bool _stoppedAFlick;
};

} // namespace orvex
