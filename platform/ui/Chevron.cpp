#include "Chevron.h"

#include <QPainter>
#include <QPolygonF>

namespace orvex {

void drawChevron(QPainter& painter, const QRectF& rectangle, ChevronDirection direction, const QColor& color,
    double lineWidth)
{
    const bool pointsLeft = direction == ChevronDirection::left;
    const double tip = pointsLeft ? rectangle.left() : rectangle.right();
    const double tail = pointsLeft ? rectangle.right() : rectangle.left();
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(color, lineWidth, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPolyline(QPolygonF{QPointF(tail, rectangle.top()), QPointF(tip, rectangle.center().y()),
        QPointF(tail, rectangle.bottom())});
    painter.restore();
}

} // namespace orvex
