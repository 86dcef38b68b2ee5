#pragma once

#include <QPointer>
#include <QWidget>

namespace orvex {

class BarButton;
class TextLabel;

// A message with one button, on a card over everything else in its window. It takes all input until it is
// dismissed, by the button, Return or Escape, and outlives the screen that showed it.
class Alert final : public QWidget {
public:
    // Shows an alert over the widget's window and returns at once. The alert deletes itself.
    static Alert& show(QWidget& over, const QString& title, const QString& message, const QString& button);

    TextLabel& title() const { return *_title; }
    TextLabel& message() const { return *_message; }
    BarButton& button() const { return *_button; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    Alert(QWidget& window, const QString& title, const QString& message, const QString& button);

    void dismiss();
    // Keeps the focus. A widget that asks for it meanwhile gets it afterwards.
    void holdFocus(QWidget* now);
    QRect card() const;

    TextLabel* _title; // children
    TextLabel* _message;
    BarButton* _button;
    QPointer<QWidget> _focusAfterwards;
};

} // namespace orvex
