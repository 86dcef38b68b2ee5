#include "TextLabel.h"

#include "Theme.h"

#include <QFontMetrics>
#include <QPainter>

#include <algorithm>

namespace orvex {

namespace {

constexpr int kFadeLength = 22;

QString inOneLine(QString text)
{
    const auto breaksLine = [](QChar character) {
        return character.category() == QChar::Other_Control || character == QChar::LineSeparator
            || character == QChar::ParagraphSeparator;
    };
    std::ranges::replace_if(text, breaksLine, QLatin1Char(' '));
    return text;
}

constexpr int kLabelFontSize = 15;
constexpr int kLargestField = 22; // pixels, in a field of 34
constexpr int kTextMargin = 8;
constexpr int kFieldCornerRadius = 6;

} // namespace

TextLabel::TextLabel(const QFont& font, QWidget* parent)
    : QLabel(parent)
{
    setTextFormat(Qt::PlainText);
    setAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    setMargin(0);
    setIndent(0);
    setFont(font);
}

void TextLabel::setLine(const QString& text)
{
    setText(inOneLine(text));
}

// Text that a scroll view cuts off fades out at the edge.
void TextLabel::paintEvent(QPaintEvent*)
{
    const int room = parentWidget() ? std::min(width(), parentWidget()->width() - x()) : width();
    QPainter painter(this);
    const QColor color = palette().color(foregroundRole());
    painter.setPen(color);
    const QRect seen = visibleRegion().boundingRect();
    if (room == width() && !seen.isEmpty() && seen.right() < width() - 1) {
        QLinearGradient fading(seen.right() - kFadeLength, 0, seen.right(), 0);
        fading.setColorAt(0, color);
        fading.setColorAt(1, QColor(color.red(), color.green(), color.blue(), 0));
        painter.setPen(QPen(fading, 1));
    }
    painter.drawText(QRect(0, 0, room, height()), Qt::AlignLeft | Qt::AlignVCenter | Qt::TextSingleLine,
        room < width() || room < sizeOfLine(text(), font()).width()
            ? fontMetrics().elidedText(text(), Qt::ElideRight, room)
            : text());
}

QSize sizeOfLine(const QString& text, const QFont& font)
{
    const QFontMetrics metrics(font);
    return {metrics.horizontalAdvance(inOneLine(text)), metrics.height()};
}

QFont fittedFont(QFont font, const QString& text, int room, int smallest)
{
    while (font.pixelSize() > smallest && sizeOfLine(text, font).width() > room)
        font.setPixelSize(font.pixelSize() - 1);
    return font;
}

TextField::TextField(QWidget* parent)
    : QLineEdit(parent)
{
    QFont font = Theme::systemFont(kLabelFontSize);
    font.setPixelSize(std::min(font.pixelSize(), kLargestField));
    setFont(font);
    QPalette colours = palette();
    colours.setColor(QPalette::Base, Qt::transparent);
    setPalette(colours);
    setFrame(false);
    setTextMargins(kTextMargin, 0, kTextMargin, 0);
}

// The frame of Qt's styles is invisible on a dark background.
void TextField::paintEvent(QPaintEvent* event)
{
    const Theme& theme = Theme::current();
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setBrush(theme.bar);
    painter.setPen(hasFocus() ? QPen(theme.tint, 1.5) : QPen(theme.barSeparator, 1));
    painter.drawRoundedRect(QRectF(rect()).adjusted(1, 1, -1, -1), kFieldCornerRadius, kFieldCornerRadius);
    painter.end();
    QLineEdit::paintEvent(event);
}

} // namespace orvex
