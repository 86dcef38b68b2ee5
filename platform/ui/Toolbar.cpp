#include "Toolbar.h"

#include "ToolbarRow.h"

namespace orvex {

Toolbar::Toolbar(QWidget* parent)
    : Bar(parent, Line::above)
{
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
    row.setGeometry(0, kLineHeight, width(), height() - kLineHeight);
}

void Toolbar::resizeEvent(QResizeEvent*)
{
    if (_row)
        place(*_row);
}

} // namespace orvex
