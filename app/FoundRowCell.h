#pragma once

#include "TableCell.h"

namespace orvex {

class TextLabel;

// A row that a search has found: name and value as on its own screen, and below them, smaller, where it
// stands. Texts too long for the row are cut, the value last.
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
