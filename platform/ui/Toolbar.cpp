#include "Toolbar.h"

#include "Theme.h"
#include "ToolbarRow.h"

#include <QPainter>

namespace orvex {

namespace {
constexpr int kSeparatorHeight = 1;
} // namespace

Toolbar::Toolbar(QWidget* parent)
    : QWidget(parent)
{
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void Toolbar::showRow(ToolbarRow* row, const ToolbarRow* replaced)
{
    if (_row == row)
        return;
    if (_row && _row != replaced)
        _row->hide();
    _row = row;
    if (!row)
        return;
    row->setParent(this);
    place(*row);
    row->show();
}

void Toolbar::place(QWidget& row) const
{
    row.setGeometry(0, kSeparatorHeight, width(), height() - kSeparatorHeight);
}

void Toolbar::resizeEvent(QResizeEvent*)
{
    if (_row)
        place(*_row);
}

void Toolbar::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), Theme::current().bar);
    painter.fillRect(QRect(0, 0, width(), kSeparatorHeight), Theme::current().barSeparator);
}

} // namespace orvex
