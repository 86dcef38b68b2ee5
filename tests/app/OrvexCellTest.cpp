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
    const struct {
        const char* name;
        QRectF bounds;
        QSizeF key, value;
        QRectF keyFrame, valueFrame, view;
        double contentWidth;
    } cases[] = {
        {"fits: value flush right", {0, 0, 365, 44}, {100, 18}, {80, 20}, {10, 13, 100, 18},
            {285, 12, 80, 20}, {0, 0, 365, 50}, 365},
        {"exactly as wide: after the gap, nothing to scroll", {0, 0, 240, 44}, {100, 18}, {80, 18},
            {10, 13, 100, 18}, {160, 13, 80, 18}, {0, 0, 240, 50}, 240},
        {"one point too wide", {0, 0, 239, 44}, {100, 18}, {80, 18}, {10, 13, 100, 18}, {160, 13, 80, 18},
            {0, 0, 239, 50}, 419},
        {"exactly as wide, not at the origin", {4, 0, 240, 44}, {100, 18}, {80, 18}, {14, 13, 100, 18},
            {164, 13, 80, 18}, {4, 0, 240, 50}, 240},
        {"bounds not at the origin", {4, 6, 300, 44}, {30, 17}, {400, 18}, {14, 13.5, 30, 17},
            {94, 13, 400, 18}, {4, 6, 300, 50}, 730},
    };
    for (const auto& test : cases) {
        SCOPED_TRACE(test.name);
        const LeafCellLayout layout = leafCellLayout(test.bounds, test.key, test.value);
        EXPECT_EQ(layout.key, test.keyFrame);
        EXPECT_EQ(layout.value, test.valueFrame);
        EXPECT_EQ(layout.view, test.view);
        EXPECT_EQ(layout.contentSize, QSizeF(test.contentWidth, 50));
        EXPECT_EQ(branchCellKeyFrame(test.bounds, test.key), test.keyFrame);
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
