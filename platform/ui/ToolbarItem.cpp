#include "ToolbarItem.h"

#include "BarButton.h"

namespace orvex {

ToolbarItem ToolbarItem::view(std::unique_ptr<QWidget> widget)
{
    return {Kind::view, std::move(widget)};
}

ToolbarItem ToolbarItem::button(const QString& title, std::function<void()> action)
{
    auto button = std::make_unique<BarButton>(BarButton::Style::plain, title);
    QObject::connect(
        button.get(), &QAbstractButton::clicked, button.get(), [action = std::move(action)] { action(); });
    return {Kind::button, std::move(button)};
}

} // namespace orvex
