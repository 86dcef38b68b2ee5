#pragma once

#include "TableCell.h"

namespace orvex {

class TextLabel;

// An entry of the snapshot to be saved.
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
