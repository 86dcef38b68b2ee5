#pragma once

#include "Animation.h"
#include "ToolbarItem.h"

#include <QWidget>

#include <vector>

namespace orvex {

// The items of one toolbar, left to right. A row is never changed: a new set of items is a new row, which
// takes the old one's place.
class ToolbarRow final : public QWidget {
public:
    struct Item {
        ToolbarItem::Kind kind;
        QWidget* widget; // null for a space
    };

    explicit ToolbarRow(std::vector<ToolbarItem> items);

    const std::vector<Item>& items() const { return _items; }

    // Takes the place of the old row, keyboard focus included, and does away with it: in a dissolve when
    // animated. While a button of the old row is held down the old row stays until it is released, or every
    // click would be lost that a refresh falls into.
    void replace(ToolbarRow* old, bool animated);

private:
    void retire(bool animated);
    QWidget* heldButton() const;

    std::vector<Item> _items;
    Transition _dissolve{this};
};

} // namespace orvex
