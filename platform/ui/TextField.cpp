#include "TextField.h"

#include "Theme.h"

namespace orvex {

namespace {
constexpr int kFontSize = 15;
constexpr int kTextMargin = 6;
} // namespace

TextField::TextField(QWidget* parent)
    : QLineEdit(parent)
{
    setFont(Theme::systemFont(kFontSize));
    QPalette colours = palette();
    colours.setColor(QPalette::Base, Theme::current().bar);
    setPalette(colours);
    setTextMargins(kTextMargin, 0, kTextMargin, 0);
}

} // namespace orvex
