#pragma once

#include "TableCell.h"

#include <QRectF>
#include <QSizeF>

namespace orvex {

class TextLabel;

// The layout of a row, in points of the content view. Both texts are measured in the bold system font of size
// 15, though the value is drawn in the regular one.

// A branch has only a name.
QRectF branchCellKeyFrame(const QRectF& bounds, const QSizeF& keySize);

// A leaf has name and value in a view that scrolls sideways when the two do not fit. key and value are in the
// coordinates of the scrolled content.
struct LeafCellLayout {
    QRectF key;
    QRectF value;
    QRectF view;
    QSizeF contentSize;
};
LeafCellLayout leafCellLayout(const QRectF& bounds, const QSizeF& keySize, const QSizeF& valueSize);

// A row of a list screen. A cell keeps the kind it is created with, even when it is reused for a row of the
// other kind: a branch cell then shows no value.
class OrvexCell final : public TableCell {
public:
    enum class Kind { branch, leaf };

    OrvexCell(Kind kind, std::string reuseIdentifier);

    TextLabel& key() const { return *_key; }
    TextLabel* value() const { return _value; }        // null in branch cells
    SidewaysScrollView* view() const { return _view; } // null in branch cells

    void setKey(const QString& text);
    // Does nothing in a branch cell.
    void setValue(const QString& text);

    // Lay the row out as a branch or as a leaf, now and after every change of size.
    void setLayoutKey();
    void setLayout();

    void layoutSubviews() override;
    SidewaysScrollView* sidewaysScrollView() const override { return _view; }

private:
    // Sets the largest fonts, down to the usual size, in which the row's texts are in view.
    void fitFonts();
    void layoutAsBranch();
    void layoutAsLeaf();
    void nameForAssistiveTechnology();

    SidewaysScrollView* _view = nullptr; // children
    TextLabel* _key = nullptr;
    TextLabel* _value = nullptr;
    Kind _layout;
};

} // namespace orvex
