#include "TouchArea.h"

namespace orvex {

TouchArea::TouchArea(QWidget* parent)
    : QAbstractButton(parent)
{
    setFocusPolicy(Qt::NoFocus);
}

} // namespace orvex
