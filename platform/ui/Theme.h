#pragma once

#include <QColor>
#include <QFont>
#include <QRectF>

class QPainter;

namespace orvex {

// Colours and fonts of all screens, in a light and a dark variant.
struct Theme {
    enum class Mode { system, light, dark };

    QColor background;
    QColor text;
    QColor secondaryText; // values, status
    QColor separator;
    QColor rowHighlight;
    QColor accessory; // chevrons, spinner, scroll indicator
    QColor bar;       // title bar and toolbar
    QColor barSeparator;
    QColor tint; // what can be tapped

    static const Theme& current();
    static bool isDark();
    // Sets variant and palette of the whole application. Mode::system follows the window colour of the
    // desktop's palette.
    static void use(Mode mode);

    // How much larger than usual the desktop's font is: 1 up to 11 points, 2 from 22 on. Fonts grow with it.
    static double fontScale();

    // One point of the design is one device-independent pixel, before the scale.
    static QFont systemFont(int points);
    static QFont boldSystemFont(int points);
};

// Draws a chevron that fills the rectangle, pointing left or right.
enum class ChevronDirection { left, right };
void drawChevron(QPainter& painter, const QRectF& rectangle, ChevronDirection direction, const QColor& color,
    double lineWidth);

} // namespace orvex
