#include "Indicators.h"

#include "Theme.h"

#include <QPainter>
#include <QTimerEvent>

#include <algorithm>
#include <chrono>

namespace orvex {

namespace {

constexpr int kSide = 20;
constexpr int kSpokes = 12;
constexpr int kMillisecondsPerSpoke = 80;

// The brightest spoke, by the clock: the spinner of a new toolbar row goes on where the old one was.
int leadingSpoke()
{
    using namespace std::chrono;
    const auto now = duration_cast<milliseconds>(steady_clock::now().time_since_epoch());
    return static_cast<int>(now.count() / kMillisecondsPerSpoke % kSpokes);
}

constexpr int kScrollBarMilliseconds = 900;
constexpr int kWidth = 3;
constexpr int kScrollBarMargin = 2;
constexpr int kMinimumLength = 36;

} // namespace

ActivityIndicator::ActivityIndicator(QWidget* parent)
    : QWidget(parent)
{
    setFixedSize(kSide, kSide);
    setAccessibleName(QStringLiteral("Connecting"));
    setVisible(false);
}

QSize ActivityIndicator::sizeHint() const
{
    return {kSide, kSide};
}

void ActivityIndicator::startAnimating()
{
    _isAnimating = true;
    updateVisibility();
}

void ActivityIndicator::stopAnimating()
{
    _isAnimating = false;
    updateVisibility();
}

void ActivityIndicator::updateVisibility()
{
    setVisible(_isAnimating && parentWidget());
}

bool ActivityIndicator::event(QEvent* event)
{
    if (event->type() == QEvent::ParentChange)
        updateVisibility();
    return QWidget::event(event);
}

void ActivityIndicator::showEvent(QShowEvent* event)
{
    if (_isAnimating)
        _ticks.start(kMillisecondsPerSpoke, this);
    QWidget::showEvent(event);
}

void ActivityIndicator::hideEvent(QHideEvent* event)
{
    _ticks.stop();
    QWidget::hideEvent(event);
}

void ActivityIndicator::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != _ticks.timerId())
        return QWidget::timerEvent(event);
    update();
}

void ActivityIndicator::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(kSide / 2.0, kSide / 2.0);
    const int leading = leadingSpoke();
    for (int spoke = 0; spoke < kSpokes; ++spoke) {
        const int age = (leading - spoke + kSpokes) % kSpokes; // 0 leads, higher fades
        QColor color = Theme::current().secondaryText;
        color.setAlphaF(1.0F - 0.8F * static_cast<float>(age) / kSpokes);
        painter.setPen(QPen(color, 1.8, Qt::SolidLine, Qt::RoundCap));
        painter.save();
        painter.rotate(spoke * 360.0 / kSpokes);
        painter.drawLine(QPointF(0, -4.5), QPointF(0, -8.2));
        painter.restore();
    }
}

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
    const double track = view.height() - 2.0 * kScrollBarMargin;
    const double length = std::max<double>(kMinimumLength, track * view.height() / contentHeight);
    const double share = std::clamp(static_cast<double>(offset) / (contentHeight - view.height()), 0.0, 1.0);
    setGeometry(view.right() - kWidth - kScrollBarMargin,
        view.top() + kScrollBarMargin + qRound(share * (track - length)), kWidth, qRound(length));
    raise();
    show();
    _rest.start(kScrollBarMilliseconds, this);
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
