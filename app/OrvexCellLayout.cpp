#include "OrvexCellLayout.h"

namespace orvex {

namespace {
constexpr double kMargin = 10;
constexpr double kKeyValueGap = 50;
constexpr double kViewHeight = 50; // higher than a row, which cuts it

double centredTop(const QRectF& bounds, const QSizeF& size)
{
    return (bounds.height() - size.height()) * 0.5;
}
} // namespace

QRectF branchCellKeyFrame(const QRectF& bounds, const QSizeF& keySize)
{
    return {QPointF(bounds.x() + kMargin, centredTop(bounds, keySize)), keySize};
}

LeafCellLayout leafCellLayout(const QRectF& bounds, const QSizeF& keySize, const QSizeF& valueSize)
{
    const double width = bounds.width();
    const double needed = keySize.width() + kMargin + kKeyValueGap + valueSize.width();
    const QRectF key = branchCellKeyFrame(bounds, keySize);
    const double valueLeft =
        needed < width ? width - valueSize.width() : key.x() + keySize.width() + kKeyValueGap;
    const double contentWidth = needed > width ? width + keySize.width() + valueSize.width() : width;
    return {
        .key = key,
        .value = {QPointF(valueLeft, centredTop(bounds, valueSize)), valueSize},
        .view = {bounds.x(), bounds.y(), width, kViewHeight},
        .contentSize = {contentWidth, kViewHeight},
    };
}

} // namespace orvex
