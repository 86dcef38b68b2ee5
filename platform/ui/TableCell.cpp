#include "TableCell.h"

#include "Theme.h"

#include <QPainter>
#include <QPolygonF>

#include <algorithm>
#include <utility>

namespace orvex {

namespace {

constexpr int kSeparatorLeft = 10;
constexpr double kChevronWidth = 6.5;
constexpr double kChevronHeight = 12;
constexpr double kChevronRight = 14; // from the chevron's tip to the edge
constexpr double kDotRadius = 1;
constexpr double kDotDistance = 3.2;
constexpr QSizeF kCheckmarkSize(13, 10);
constexpr int kAccessoryWidth = 20; // taken from the content view by a chevron or checkmark

} // namespace

SidewaysScrollView::SidewaysScrollView(QWidget* parent)
    : QWidget(parent)
    , _content(new QWidget(this))
{
}

void SidewaysScrollView::setContentSize(const QSize& size)
{
    _content->resize(size);
    setOffset(_offset);
}

bool SidewaysScrollView::hidesContentAtRight() const
{
    return _content->childrenRect().right() + _content->x() >= width();
}

void SidewaysScrollView::setOffset(int offset, int overshoot)
{
    _offset = std::clamp(offset, 0, maximumOffset());
    _content->move(-_offset - overshoot, 0);
    if (parentWidget() && parentWidget()->parentWidget())
        parentWidget()->parentWidget()->update(); // the row draws the mark for hidden content
}

void SidewaysScrollView::resizeEvent(QResizeEvent*)
{
    setOffset(_offset);
}

TableCell::TableCell(std::string reuseIdentifier)
    : _reuseIdentifier(std::move(reuseIdentifier))
    , _contentView(new QWidget(this))
{
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

void TableCell::setAccessory(Accessory accessory)
{
    if (_accessory == accessory)
        return;
    _accessory = accessory;
    layoutSubviews();
    update();
}

void TableCell::setHighlighted(bool highlighted)
{
    if (_isHighlighted == highlighted)
        return;
    _isHighlighted = highlighted;
    update();
}

void TableCell::layoutSubviews()
{
    const int accessoryWidth = _accessory == Accessory::none ? 0 : kAccessoryWidth;
    _contentView->setGeometry(0, 0, std::max(0, width() - accessoryWidth - kRightInset), height());
}

void TableCell::resizeEvent(QResizeEvent*)
{
    layoutSubviews();
}

void TableCell::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::current();
    QPainter painter(this);
    if (_isHighlighted)
        painter.fillRect(rect(), theme.rowHighlight);
    painter.fillRect(QRect(kSeparatorLeft, height() - 1, width() - kSeparatorLeft, 1), theme.separator);
    if (_accessory == Accessory::disclosureIndicator) {
        const QRectF chevron(width() - kChevronRight - kChevronWidth, (height() - kChevronHeight) / 2.0,
            kChevronWidth, kChevronHeight);
        drawChevron(painter, chevron, ChevronDirection::right, theme.accessory, 2);
    }
    if (_accessory == Accessory::checkmark)
        drawCheckmark(painter);
    if (sidewaysScrollView() && sidewaysScrollView()->hidesContentAtRight())
        drawMoreMark(painter);
}

void TableCell::drawCheckmark(QPainter& painter) const
{
    const QPointF topLeft(
        width() - kChevronRight - kCheckmarkSize.width(), (height() - kCheckmarkSize.height()) / 2);
    const auto at = [&](double right, double down) {
        return topLeft + QPointF(right * kCheckmarkSize.width(), down * kCheckmarkSize.height());
    };
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(Theme::current().tint, 2, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPolyline(QPolygonF{at(0, 0.55), at(0.36, 1), at(1, 0)});
    painter.restore();
}

// Three dots: without them nobody would look for a value that is entirely out of view.
void TableCell::drawMoreMark(QPainter& painter) const
{
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(Theme::current().accessory);
    const QPointF middle(_contentView->geometry().right() + kRightInset * 0.5 - 1, height() * 0.5 + 4);
    for (const int dot : {-1, 0, 1})
        painter.drawEllipse(middle + QPointF(dot * kDotDistance, 0), kDotRadius, kDotRadius);
}

} // namespace orvex
