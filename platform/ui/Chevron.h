#pragma once

#include <QColor>
#include <QRectF>

class QPainter;

namespace orvex {

// Draws a chevron that fills the rectangle, pointing left or right.
enum class ChevronDirection { left, right };
void drawChevron(QPainter& painter, const QRectF& rectangle, ChevronDirection direction, const QColor& color,
    double lineWidth);

} // namespace orvex
