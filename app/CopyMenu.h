#pragma once

#include <QString>

class QPoint;
class QWidget;

namespace orvex {

// Copies a text to the clipboard.
void copyText(const QString& text);

// Opens a menu that copies the row or the whole screen, as they are at this moment, and returns at once.
void showCopyMenu(QWidget& parent, const QPoint& globalPlace, const QString& row, const QString& screen);

} // namespace orvex
