#pragma once

#include <QPointer>
#include <QWidget>

namespace orvex {

class BarButton;
class TextLabel;

// A message with one button, on a card over everything else in its window. It takes all input until the
// button is pressed, by Return or Escape too, and stays when the screen that showed it goes.
class Alert final : public QWidget {
public:
    // Shows an alert over the window of the widget and does not wait. It deletes itself.
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
    // Keeps the keyboard, whoever asks for it meanwhile; that one gets it afterwards.
    void holdFocus(QWidget* now);
    QRect card() const;

    TextLabel* _title; // children
    TextLabel* _message;
    BarButton* _button;
    QPointer<QWidget> _focusAfterwards;
};

} // namespace orvex
