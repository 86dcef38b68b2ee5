#pragma once

#include "TableCell.h"

namespace orvex {

class TextLabel;

// A row of a list screen. It is made as a branch, with a name only, or as a leaf, with name and value in a
// view that scrolls sideways, and stays what it was made as even when it is reused for a row of the other
// kind: a branch cell shows no value then.
class OrvexCell final : public TableCell {
public:
    enum class Kind { branch, leaf };

    OrvexCell(Kind kind, std::string reuseIdentifier);

    TextLabel& key() const { return *_key; }
    TextLabel* value() const { return _value; }        // null in branch cells
    SidewaysScrollView* view() const { return _view; } // null in branch cells

    void setKey(const QString& text);
    // Nothing to a branch cell.
    void setValue(const QString& text);

    // Lay the row out as a branch or as a leaf, from now on at every change of size too.
    void setLayoutKey();
    void setLayout();

    void layoutSubviews() override;
    SidewaysScrollView* sidewaysScrollView() const override { return _view; }

private:
    void layoutAsBranch();
    void layoutAsLeaf();
    void nameForAssistiveTechnology();

    SidewaysScrollView* _view = nullptr; // children
    TextLabel* _key = nullptr;
    TextLabel* _value = nullptr;
    Kind _layout;
};

} // namespace orvex
