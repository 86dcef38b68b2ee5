#include "TableDrag.h"

#include <QGuiApplication>
#include <QStyleHints>

#include <algorithm>
#include <cmath>

namespace orvex {

bool TableDrag::moveTo(const QPointF& position)
{
    const QPointF travel = position - _start;
    if (_axis == Axis::undecided) {
        const double slop = QGuiApplication::styleHints()->startDragDistance();
        if (travel.manhattanLength() < slop)
            return false;
        _axis = std::abs(travel.x()) > std::abs(travel.y()) ? Axis::horizontal : Axis::vertical;
        const double along = _axis == Axis::horizontal ? travel.x() : travel.y();
        _slack = std::clamp(along, -slop, slop);
    }
    _fed = _axis == Axis::horizontal ? _start + QPointF(travel.x() - _slack, 0)
                                     : _start + QPointF(0, travel.y() - _slack);
    return true;
}

} // namespace orvex
