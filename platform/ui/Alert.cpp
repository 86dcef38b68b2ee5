#include "Alert.h"

#include "Bar.h"
#include "TextLabel.h"
#include "Theme.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPainter>

namespace orvex {

namespace {
constexpr QSize kCardSize(280, 132);
constexpr int kAlertCornerRadius = 12;
constexpr int kTitleTop = 18;
constexpr int kMessageTop = 46;
constexpr int kLineHeight = 22;
constexpr int kAlertButtonHeight = 44;
const QColor kShade(0, 0, 0, 110);

void centre(TextLabel& label, const QRect& card, int top)
{
    const int width = std::min(sizeOfLine(label.text(), label.font()).width(), card.width());
    label.setGeometry(card.left() + (card.width() - width) / 2, card.top() + top, width, kLineHeight);
}
} // namespace

Alert& Alert::show(QWidget& over, const QString& title, const QString& message, const QString& button)
{
    auto* const alert = new Alert(*over.window(), title, message, button);
    alert->QWidget::show();
    alert->raise();
    alert->setFocus();
    return *alert;
}

Alert::Alert(QWidget& window, const QString& title, const QString& message, const QString& button)
    : QWidget(&window)
    , _title(new TextLabel(Theme::boldSystemFont(17), this))
    , _message(new TextLabel(Theme::systemFont(14), this))
    , _button(new BarButton(BarButton::Style::plain, button, this))
{
    _title->setLine(title);
    _message->setLine(message);
    setAccessibleName(title);
    setAccessibleDescription(message);
    setFocusPolicy(Qt::StrongFocus);
    connect(_button, &BarButton::clicked, this, &Alert::dismiss);
    connect(qApp, &QApplication::focusChanged, this, [this](QWidget*, QWidget* now) { holdFocus(now); });
    window.installEventFilter(this);
    resize(window.size());
}

void Alert::holdFocus(QWidget* now)
{
    if (!now || now == this || now->window() != window() || isAncestorOf(now))
        return;
    _focusAfterwards = now;
    setFocus();
}

void Alert::dismiss()
{
    qApp->disconnect(this);
    if (_focusAfterwards)
        _focusAfterwards->setFocus();
    hide();
    deleteLater();
}

QRect Alert::card() const
{
    QRect result({}, kCardSize);
    result.moveCenter(rect().center());
    return result;
}

bool Alert::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::Resize)
        resize(parentWidget()->size());
    return QWidget::eventFilter(watched, event);
}

void Alert::resizeEvent(QResizeEvent*)
{
    centre(*_title, card(), kTitleTop);
    centre(*_message, card(), kMessageTop);
    _button->setGeometry(
        card().left(), card().bottom() + 1 - kAlertButtonHeight, kCardSize.width(), kAlertButtonHeight);
}

void Alert::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::current();
    QPainter painter(this);
    painter.fillRect(rect(), kShade);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(theme.bar);
    painter.drawRoundedRect(card(), kAlertCornerRadius, kAlertCornerRadius);
    painter.setRenderHint(QPainter::Antialiasing, false);
    painter.fillRect(QRect(card().left(), _button->y() - 1, card().width(), 1), theme.barSeparator);
}

// Swallowed: nothing below the alert may see it.
void Alert::mousePressEvent(QMouseEvent*) { }

void Alert::keyPressEvent(QKeyEvent* event)
{
    const int key = event->key();
    if (key == Qt::Key_Return || key == Qt::Key_Enter || key == Qt::Key_Escape)
        dismiss();
}

} // namespace orvex
