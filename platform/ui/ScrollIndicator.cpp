#include "ScrollIndicator.h"

#include "Theme.h"

#include <QPainter>
#include <QTimerEvent>

#include <algorithm>

namespace orvex {

namespace {
constexpr int kMillisecondsShown = 900;
constexpr int kWidth = 3;
constexpr int kMargin = 2;
constexpr int kMinimumLength = 36;
} // namespace

ScrollIndicator::ScrollIndicator(QWidget* parent)
    : QWidget(parent)
{
    setAttribute(Qt::WA_TransparentForMouseEvents);
    hide();
}

void ScrollIndicator::flash(int offset, int contentHeight, const QRect& view)
{
    if (contentHeight <= view.height())
        return hide();
    const double track = view.height() - 2.0 * kMargin;
    const double length = std::max<double>(kMinimumLength, track * view.height() / contentHeight);
    const double share = std::clamp(static_cast<double>(offset) / (contentHeight - view.height()), 0.0, 1.0);
    setGeometry(view.right() - kWidth - kMargin, view.top() + kMargin + qRound(share * (track - length)),
        kWidth, qRound(length));
    raise();
    show();
    _rest.start(kMillisecondsShown, this);
}

void ScrollIndicator::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != _rest.timerId())
        return QWidget::timerEvent(event);
    _rest.stop();
    hide();
}

void ScrollIndicator::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(Theme::current().accessory);
    painter.drawRoundedRect(rect(), kWidth / 2.0, kWidth / 2.0);
}

} // namespace orvex
