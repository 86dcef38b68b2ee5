#pragma once

#include <QString>
#include <QWidget>

#include <functional>
#include <memory>
#include <utility>

namespace orvex {

// One thing in a toolbar: a view, a button or the space that pushes what follows to the right.
class ToolbarItem {
public:
    enum class Kind { view, button, flexibleSpace };

    static ToolbarItem view(std::unique_ptr<QWidget> widget);
    static ToolbarItem button(const QString& title, std::function<void()> action);
    static ToolbarItem flexibleSpace() { return {Kind::flexibleSpace, nullptr}; }

    Kind kind() const { return _kind; }
    // The view or the button; null for a space. Hands over the ownership.
    std::unique_ptr<QWidget> takeWidget() { return std::move(_widget); }

private:
    ToolbarItem(Kind kind, std::unique_ptr<QWidget> widget)
        : _kind(kind)
        , _widget(std::move(widget))
    {
    }

    Kind _kind;
    std::unique_ptr<QWidget> _widget;
};

} // namespace orvex
