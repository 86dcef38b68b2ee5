#include "TextField.h"

#include "Theme.h"

#include <QPainter>

namespace orvex {

namespace {
constexpr int kFontSize = 15;
constexpr int kTextMargin = 8;
constexpr int kCornerRadius = 6;
} // namespace

TextField::TextField(QWidget* parent)
    : QLineEdit(parent)
{
    setFont(Theme::systemFont(kFontSize));
    QPalette colours = palette();
    colours.setColor(QPalette::Base, Qt::transparent);
    setPalette(colours);
    setFrame(false);
    setTextMargins(kTextMargin, 0, kTextMargin, 0);
}

// A style's own frame is lost on a dark background.
void TextField::paintEvent(QPaintEvent* event)
{
    const Theme& theme = Theme::current();
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setBrush(theme.bar);
    painter.setPen(hasFocus() ? QPen(theme.tint, 1.5) : QPen(theme.barSeparator, 1));
    painter.drawRoundedRect(QRectF(rect()).adjusted(1, 1, -1, -1), kCornerRadius, kCornerRadius);
    painter.end();
    QLineEdit::paintEvent(event);
}

} // namespace orvex
