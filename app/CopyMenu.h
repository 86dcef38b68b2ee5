#pragma once

#include <QString>

class QPoint;
class QWidget;

namespace orvex {

// Copies a text to the clipboard.
void copyText(const QString& text);

// Opens the menu of a row, which copies the row or the whole screen, and returns at once. The texts are those
// of the moment in which it opens.
void showCopyMenu(QWidget& parent, const QPoint& globalPlace, const QString& row, const QString& screen);

} // namespace orvex
