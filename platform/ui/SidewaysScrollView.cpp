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

void SidewaysScrollView::setOffset(int offset, int overshoot)
{
    _offset = std::clamp(offset, 0, maximumOffset());
    _content->move(-_offset - overshoot, 0);
}

void SidewaysScrollView::resizeEvent(QResizeEvent*)
{
    setOffset(_offset);
}

} // namespace orvex
