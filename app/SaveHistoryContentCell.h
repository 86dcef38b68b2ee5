#pragma once

#include "TableCell.h"

namespace orvex {

class TextLabel;

// One thing that a snapshot will hold.
class SaveHistoryContentCell final : public TableCell {
public:
    explicit SaveHistoryContentCell(std::string reuseIdentifier);

    void setText(const QString& text);
    TextLabel& text() const { return *_text; }

    void layoutSubviews() override;

private:
    TextLabel* _text; // child
};

} // namespace orvex
