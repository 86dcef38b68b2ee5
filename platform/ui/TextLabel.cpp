#include "TextLabel.h"

#include <QFontMetrics>

#include <algorithm>

namespace orvex {

namespace {
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

QSize sizeOfLine(const QString& text, const QFont& font)
{
    const QFontMetrics metrics(font);
    return {metrics.horizontalAdvance(inOneLine(text)), metrics.height()};
}

} // namespace orvex
