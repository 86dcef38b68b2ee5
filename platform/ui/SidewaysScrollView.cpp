#include "SidewaysScrollView.h"

#include <algorithm>

namespace orvex {

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
        parentWidget()->parentWidget()->update(); // the row marks beside this view what it hides
}

void SidewaysScrollView::resizeEvent(QResizeEvent*)
{
    setOffset(_offset);
}

} // namespace orvex
