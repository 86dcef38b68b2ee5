#pragma once

#include "TableCell.h"

namespace orvex {

class TextLabel;

// A row found by a search: name and value as on its own screen, with its path in smaller type below. Texts
// too long for the row are elided, the value last.
class FoundRowCell final : public TableCell {
public:
    explicit FoundRowCell(std::string reuseIdentifier);

    void setTexts(const QString& name, const QString& value, const QString& place);

    TextLabel& name() const { return *_name; }
    TextLabel& value() const { return *_value; }
    TextLabel& place() const { return *_place; }

    void layoutSubviews() override;

private:
    TextLabel* _name; // children
    TextLabel* _value;
    TextLabel* _place;
};

} // namespace orvex
