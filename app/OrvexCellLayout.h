#pragma once

#include <QRectF>
#include <QSizeF>

namespace orvex {

// Where the parts of a row stand, in points of the content view. Sizes of texts are those of the bold system
// font of size 15, of the value too, though that is drawn in the regular font: a value keeps its place
// whichever font shows it.

// A branch: the name alone.
QRectF branchCellKeyFrame(const QRectF& bounds, const QSizeF& keySize);

// A leaf: name and value inside a view that scrolls sideways when the two do not fit. key and value are in
// the coordinates of the scrolled content.
struct LeafCellLayout {
    QRectF key;
    QRectF value;
    QRectF view;
    QSizeF contentSize;
};
LeafCellLayout leafCellLayout(const QRectF& bounds, const QSizeF& keySize, const QSizeF& valueSize);

} // namespace orvex
