#include "Screen.h"

#include "NavigationStack.h"
#include "Theme.h"

#include <QPaintEvent>
#include <QPainter>

namespace orvex {

Screen::Screen(QWidget* parent)
    : QWidget(parent)
{
    setAttribute(Qt::WA_OpaquePaintEvent);
}

Screen::~Screen()
{
    delete _toolbarRow;
}

void Screen::setTitle(const QString& title)
{
    _title = title;
    setAccessibleName(title);
    if (_stack)
        _stack->titleChanged();
}

void Screen::setToolbarItems(std::vector<ToolbarItem> items, bool animated)
{
    ToolbarRow* const old = _toolbarRow;
    _toolbarRow = new ToolbarRow(std::move(items));
    if (_stack)
        _stack->toolbarRowChanged(*this, old);
    _toolbarRow->replace(old, animated);
}

void Screen::paintEvent(QPaintEvent* event)
{
    QPainter(this).fillRect(event->rect(), Theme::current().background);
}

TouchArea::TouchArea(QWidget* parent)
    : QAbstractButton(parent)
{
    setFocusPolicy(Qt::NoFocus);
}

} // namespace orvex
