#pragma once

#include "Animation.h"
#include "Bar.h"

#include <QPointer>
#include <QString>
#include <QWidget>

#include <functional>
#include <memory>
#include <utility>
#include <vector>

namespace orvex {

// An item of a toolbar: a view, a button or the space that pushes what follows to the right.
class ToolbarItem {
public:
    enum class Kind { view, button, flexibleSpace };

    static ToolbarItem view(std::unique_ptr<QWidget> widget);
    static ToolbarItem button(const QString& title, std::function<void()> action);
    static ToolbarItem flexibleSpace() { return {Kind::flexibleSpace, nullptr}; }

    Kind kind() const { return _kind; }
    // The view or the button, with its ownership; null for a space.
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

// The items of one toolbar, left to right. A row never changes: a new set of items is a new row, which
// replaces the old one.
class ToolbarRow final : public QWidget {
public:
    struct Item {
        ToolbarItem::Kind kind;
        QWidget* widget; // null for a space
    };

    explicit ToolbarRow(std::vector<ToolbarItem> items);

    const std::vector<Item>& items() const { return _items; }

    // Takes the place of the old row, keyboard focus included, and deletes it, after a dissolve if animated.
    // A row with a button held down stays until the button is released; otherwise a refresh in the middle of
    // a click would lose the click.
    void replace(ToolbarRow* old, bool animated);

private:
    void retire(bool animated);
    QWidget* heldButton() const;

    std::vector<Item> _items;
    Transition _dissolve{this};
};

// The bar at the bottom: shows the row of the top screen.
class Toolbar final : public Bar {
public:
    explicit Toolbar(QWidget* parent);

    // The row still belongs to its screen; null empties the bar. Hides the row shown so far unless the new
    // one replaces it: then the new one decides when it goes.
    void showRow(ToolbarRow* row, const ToolbarRow* replaced = nullptr);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void place(QWidget& row) const;

    QPointer<ToolbarRow> _row;
};

} // namespace orvex
