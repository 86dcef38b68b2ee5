#include "OrvexCell.h"
#include "OrvexCellLayout.h"

#include "SidewaysScrollView.h"
#include "TextLabel.h"
#include "Theme.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

TEST(OrvexCellLayout, PlacesALeafByTheTextSizes)
{
    const QSizeF key(100, 17);
    const QSizeF value(80, 20);
    const struct {
        const char* name;
        double width;
        double valueLeft;
        double contentWidth;
    } cases[] = {
        {"fits: value flush right", 365, 285, 365},
        {"exactly as wide: after the gap, nothing to scroll", 240, 164, 240},
        {"one point too wide", 239, 164, 419},
    };
    for (const auto& [name, width, valueLeft, contentWidth] : cases) {
        SCOPED_TRACE(name);
        const QRectF bounds(4, 6, width, 44);
        const LeafCellLayout layout = leafCellLayout(bounds, key, value);
        EXPECT_EQ(layout.key, QRectF(14, 13.5, 100, 17));
        EXPECT_EQ(layout.value, QRectF(valueLeft, 12, 80, 20));
        EXPECT_EQ(layout.view, QRectF(4, 6, width, 50));
        EXPECT_EQ(layout.contentSize, QSizeF(contentWidth, 50));
        EXPECT_EQ(branchCellKeyFrame(bounds, key), layout.key);
    }
}

TEST(OrvexCell, MeasuresTheValueInTheBoldFontAndScrollsByBothWidths)
{
    OrvexCell cell(OrvexCell::Kind::leaf, "cell");
    cell.setKey("Measurement Rules");
    cell.setValue(QString(60, 'x'));
    cell.setLayout();
    cell.resize(375, 44);
    cell.show();

    EXPECT_FALSE(cell.value()->font().bold());
    const int keyWidth = sizeOfLine("Measurement Rules", Theme::boldSystemFont(15)).width();
    const int valueWidth = sizeOfLine(QString(60, 'x'), Theme::boldSystemFont(15)).width();
    ASSERT_GT(valueWidth, sizeOfLine(QString(60, 'x'), Theme::systemFont(15)).width());
    EXPECT_EQ(cell.value()->x(), 10 + keyWidth + 50);
    EXPECT_EQ(cell.view()->maximumOffset(), keyWidth + valueWidth);
    cell.view()->setOffset(100'000);
    EXPECT_EQ(cell.view()->offset(), keyWidth + valueWidth);

    cell.resize(2000, 44);
    EXPECT_EQ(cell.value()->x(), 2000 - 10 - valueWidth); // 10 points are kept free at the right
    EXPECT_EQ(cell.view()->offset(), 0);
}

TEST(OrvexCell, ShowsTextsFromTheAirAsOnePlainLine)
{
    OrvexCell cell(OrvexCell::Kind::leaf, "cell");
    cell.setKey("Name");
    cell.setValue("<b>One</b>\nTwo");
    EXPECT_EQ(cell.value()->text(), "<b>One</b> Two");
    EXPECT_EQ(cell.value()->textFormat(), Qt::PlainText);
    EXPECT_EQ(cell.accessibleName(), "Name, <b>One</b> Two");
}

} // namespace
} // namespace orvex::test
