#include "TextLabel.h"

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

// Text that a view cuts off fades away at the edge.
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

} // namespace orvex
