#include "OrvexCell.h"

#include "TextLabel.h"
#include "Theme.h"

namespace orvex {

namespace {

constexpr int kCellFontSize = 15;
constexpr double kCellMargin = 10;
constexpr double kKeyValueGap = 50;
constexpr double kViewHeight = 50; // taller than a row, which clips it

double centredTop(const QRectF& bounds, const QSizeF& size)
{
    return (bounds.height() - size.height()) * 0.5;
}

} // namespace

QRectF branchCellKeyFrame(const QRectF& bounds, const QSizeF& keySize)
{
    return {QPointF(bounds.x() + kCellMargin, centredTop(bounds, keySize)), keySize};
}

LeafCellLayout leafCellLayout(const QRectF& bounds, const QSizeF& keySize, const QSizeF& valueSize)
{
    const double width = bounds.width();
    const double needed = keySize.width() + kCellMargin + kKeyValueGap + valueSize.width();
    const QRectF key = branchCellKeyFrame(bounds, keySize);
    const double valueLeft =
        needed < width ? width - valueSize.width() : key.x() + keySize.width() + kKeyValueGap;
    const double contentWidth = needed > width ? width + keySize.width() + valueSize.width() : width;
    return {
        .key = key,
        .value = {QPointF(valueLeft, centredTop(bounds, valueSize)), valueSize},
        .view = {bounds.x(), bounds.y(), width, kViewHeight},
        .contentSize = {contentWidth, kViewHeight},
    };
}

OrvexCell::OrvexCell(Kind kind, std::string reuseIdentifier)
    : TableCell(std::move(reuseIdentifier))
    , _layout(kind)
{
    QWidget* parent = contentView();
    if (kind == Kind::leaf) {
        _view = new SidewaysScrollView(contentView());
        parent = _view->content();
    }
    _key = new TextLabel(Theme::boldSystemFont(kCellFontSize), parent);
    if (kind == Kind::leaf) {
        _value = new TextLabel(Theme::systemFont(kCellFontSize), parent);
        QPalette palette = _value->palette();
        palette.setColor(QPalette::WindowText, Theme::current().secondaryText);
        _value->setPalette(palette);
    }
}

void OrvexCell::setKey(const QString& text)
{
    _key->setLine(text);
    nameForAssistiveTechnology();
}

void OrvexCell::setValue(const QString& text)
{
    if (!_value)
        return;
    _value->setLine(text);
    nameForAssistiveTechnology();
}

void OrvexCell::nameForAssistiveTechnology()
{
    const bool hasValue = _value && !_value->text().isEmpty();
    setAccessibleName(hasValue ? _key->text() + QStringLiteral(", ") + _value->text() : _key->text());
}

void OrvexCell::setLayoutKey()
{
    _layout = Kind::branch;
    layoutSubviews();
}

void OrvexCell::setLayout()
{
    _layout = Kind::leaf;
    layoutSubviews();
}

void OrvexCell::layoutSubviews()
{
    TableCell::layoutSubviews();
    fitFonts();
    if (_layout == Kind::branch)
        layoutAsBranch();
    else
        layoutAsLeaf();
}

void OrvexCell::fitFonts()
{
    QFont bold = Theme::boldSystemFont(kCellFontSize);
    const double room = contentView()->width() - kCellMargin;
    const auto needed = [&] {
        const int value = _value ? sizeOfLine(_value->text(), bold).width() : 0;
        return sizeOfLine(_key->text(), bold).width() + (value > 0 ? kKeyValueGap + value : 0);
    };
    while (bold.pixelSize() > kCellFontSize && needed() >= room)
        bold.setPixelSize(bold.pixelSize() - 1);
    if (bold.pixelSize() == _key->font().pixelSize())
        return;
    _key->setFont(bold);
    if (_value) {
        QFont regular = _value->font();
        regular.setPixelSize(bold.pixelSize());
        _value->setFont(regular);
    }
}

void OrvexCell::layoutAsBranch()
{
    const QSizeF keySize = sizeOfLine(_key->text(), _key->font());
    _key->setGeometry(branchCellKeyFrame(contentView()->rect(), keySize).toRect());
}

void OrvexCell::layoutAsLeaf()
{
    const QFont& bold = _key->font();
    const QSizeF keySize = sizeOfLine(_key->text(), bold);
    const QSizeF valueSize = _value ? QSizeF(sizeOfLine(_value->text(), bold)) : QSizeF();
    const LeafCellLayout layout = leafCellLayout(contentView()->rect(), keySize, valueSize);
    _key->setGeometry(layout.key.toRect());
    if (!_view || !_value)
        return;
    _value->setGeometry(layout.value.toRect());
    _view->setGeometry(layout.view.toRect());
    _view->setContentSize(layout.contentSize.toSize());
}

} // namespace orvex
