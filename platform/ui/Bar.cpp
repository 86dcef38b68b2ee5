#include "Bar.h"

#include "Theme.h"

#include <QPainter>

namespace orvex {

Bar::Bar(QWidget* parent, Line line)
    : QWidget(parent)
    , _line(line)
{
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void Bar::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), Theme::current().bar);
    const int top = _line == Line::above ? 0 : height() - kLineHeight;
    painter.fillRect(QRect(0, top, width(), kLineHeight), Theme::current().barSeparator);
}

} // namespace orvex
