#pragma once

class QString;
class QWidget;

namespace orvex {

// Shows a message with one button over the window of the widget, and does not wait for the answer. It stays
// when the screen that showed it goes.
void showAlert(QWidget& over, const QString& title, const QString& message, const QString& button);

} // namespace orvex
