#include "SaveHistoryContentCell.h"

#include "TextLabel.h"

namespace orvex {

namespace {
constexpr int kLeft = 10;

QFont contentFont()
{
    QFont font(QStringLiteral("Helvetica"));
    font.setPixelSize(13);
    return font;
}
} // namespace

SaveHistoryContentCell::SaveHistoryContentCell(std::string reuseIdentifier)
    : TableCell(std::move(reuseIdentifier))
    , _text(new TextLabel(contentFont(), contentView()))
{
}

void SaveHistoryContentCell::setText(const QString& text)
{
    _text->setLine(text);
    setAccessibleName(text);
}

void SaveHistoryContentCell::layoutSubviews()
{
    TableCell::layoutSubviews();
    _text->setGeometry(contentView()->rect().adjusted(kLeft, 0, 0, 0));
}

} // namespace orvex
