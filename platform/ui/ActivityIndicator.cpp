#include "ActivityIndicator.h"

#include "Theme.h"

#include <QPainter>
#include <QTimerEvent>

#include <chrono>

namespace orvex {

namespace {
constexpr int kSide = 20;
constexpr int kSpokes = 12;
constexpr int kMillisecondsPerSpoke = 80;

// Which spoke leads. Read from the clock: a toolbar that is built anew goes on where the old one stood.
int leadingSpoke()
{
    using namespace std::chrono;
    const auto now = duration_cast<milliseconds>(steady_clock::now().time_since_epoch());
    return static_cast<int>(now.count() / kMillisecondsPerSpoke % kSpokes);
}
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

} // namespace orvex
