#include "BarButton.h"

#include "Chevron.h"
#include "Theme.h"

#include <QPainter>

namespace orvex {

namespace {
constexpr int kHeight = 36;
constexpr int kPadding = 8;
constexpr int kChevronWidth = 8;
constexpr int kChevronHeight = 15;
constexpr int kChevronGap = 7;
} // namespace

BarButton::BarButton(Style style, const QString& title, QWidget* parent)
    : QAbstractButton(parent)
    , _style(style)
{
    setText(title);
    setFont(style == Style::back ? Theme::systemFont(15) : Theme::boldSystemFont(15));
    setFocusPolicy(Qt::TabFocus);
    setCursor(Qt::PointingHandCursor);
}

int BarButton::textLeft() const
{
    return _style == Style::back ? kPadding + kChevronWidth + kChevronGap : kPadding;
}

QSize BarButton::sizeHint() const
{
    return {textLeft() + fontMetrics().horizontalAdvance(text()) + kPadding, kHeight};
}

QSize BarButton::minimumSizeHint() const
{
    return {textLeft() + kPadding, kHeight};
}

void BarButton::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    QColor color = Theme::current().tint;
    if (isDown())
        color.setAlphaF(0.4F);
    if (hasFocus()) {
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(QPen(Theme::current().tint, 1.5));
        painter.drawRoundedRect(QRectF(rect()).adjusted(1, 2, -1, -2), 6, 6);
    }
    if (_style == Style::back) {
        const QRectF chevron(kPadding, (height() - kChevronHeight) / 2.0, kChevronWidth, kChevronHeight);
        drawChevron(painter, chevron, ChevronDirection::left, color, 2.4);
    }
    painter.setPen(color);
    const QRect place(textLeft(), 0, width() - textLeft() - kPadding, height());
    const auto side = _style == Style::back ? Qt::AlignLeft : Qt::AlignHCenter;
    // Cutting counts fractions of a pixel, which the size hint rounds off.
    const bool fits = fontMetrics().horizontalAdvance(text()) <= place.width();
    const QString fitted = fits ? text() : fontMetrics().elidedText(text(), Qt::ElideRight, place.width());
    painter.drawText(place, static_cast<int>(side | Qt::AlignVCenter) | Qt::TextSingleLine, fitted);
}

} // namespace orvex
