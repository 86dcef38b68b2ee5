#include "Veil.h"

#include "Theme.h"

#include <QPaintEvent>
#include <QPainter>

namespace orvex {

namespace {
constexpr float kStrength = 0.35F; // values stay readable
}

Veil::Veil(QWidget* parent)
    : QWidget(parent)
{
    setAttribute(Qt::WA_TransparentForMouseEvents);
    hide();
}

void Veil::paintEvent(QPaintEvent* event)
{
    QColor colour = Theme::current().background;
    colour.setAlphaF(kStrength);
    QPainter(this).fillRect(event->rect(), colour);
}

} // namespace orvex
