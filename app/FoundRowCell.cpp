#include "FoundRowCell.h"

#include "TextLabel.h"
#include "Theme.h"

#include <algorithm>

namespace orvex {

namespace {

constexpr int kFoundRowFontSize = 15;
constexpr int kPlaceFontSize = 12;
constexpr double kMostGrowth = 1.2; // more would not leave room for two lines
constexpr int kFoundRowMargin = 10;
constexpr int kGap = 10;
constexpr double kPlaceTop = 0.55; // of the height

QFont limited(QFont font, int designSize)
{
    font.setPixelSize(std::min(font.pixelSize(), qRound(designSize * kMostGrowth)));
    return font;
}

TextLabel* greyLabel(int fontSize, QWidget* parent)
{
    auto* const label = new TextLabel(limited(Theme::systemFont(fontSize), fontSize), parent);
    QPalette palette = label->palette();
    palette.setColor(QPalette::WindowText, Theme::current().secondaryText);
    label->setPalette(palette);
    return label;
}

} // namespace

FoundRowCell::FoundRowCell(std::string reuseIdentifier)
    : TableCell(std::move(reuseIdentifier))
    , _name(
          new TextLabel(limited(Theme::boldSystemFont(kFoundRowFontSize), kFoundRowFontSize), contentView()))
    , _value(greyLabel(kFoundRowFontSize, contentView()))
    , _place(greyLabel(kPlaceFontSize, contentView()))
{
}

void FoundRowCell::setTexts(const QString& name, const QString& value, const QString& place)
{
    _name->setLine(name);
    _value->setLine(value);
    _place->setLine(place);
    setAccessibleName(name + QStringLiteral(", ") + (value.isEmpty() ? place : value));
    layoutSubviews();
}

void FoundRowCell::layoutSubviews()
{
    TableCell::layoutSubviews();
    const int width = contentView()->width() - kFoundRowMargin;
    const int placeTop = static_cast<int>(height() * kPlaceTop);
    const int valueWidth = std::min(sizeOfLine(_value->text(), _value->font()).width(), width);
    _value->setGeometry(kFoundRowMargin + width - valueWidth, 0, valueWidth, placeTop + kFoundRowMargin / 2);
    _name->setGeometry(
        kFoundRowMargin, 0, std::max(0, width - valueWidth - kGap), placeTop + kFoundRowMargin / 2);
    _place->setGeometry(kFoundRowMargin, placeTop, width, height() - placeTop);
}

} // namespace orvex
