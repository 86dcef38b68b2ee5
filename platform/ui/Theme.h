#pragma once

#include <QColor>
#include <QFont>

namespace orvex {

// Colours and fonts of all screens. Everything is drawn from these, so a light and a dark variant are two
// rows of one table.
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
    // Chooses the variant for the whole application and gives it the matching palette. Mode::system follows
    // the window colour of the palette that the desktop gave to the application.
    static void use(Mode mode);

    // One point of the design is one device-independent pixel.
    static QFont systemFont(int points);
    static QFont boldSystemFont(int points);
};

} // namespace orvex
