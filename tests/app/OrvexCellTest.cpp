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
        {"one point to spare", {0, 0, 241, 44}, {100, 18}, {80, 18}, {10, 13, 100, 18}, {161, 13, 80, 18},
            {0, 0, 241, 50}, 241},
        {"exactly as wide: after the gap, nothing to scroll", {0, 0, 240, 44}, {100, 18}, {80, 18},
            {10, 13, 100, 18}, {160, 13, 80, 18}, {0, 0, 240, 50}, 240},
        {"one point too wide", {0, 0, 239, 44}, {100, 18}, {80, 18}, {10, 13, 100, 18}, {160, 13, 80, 18},
            {0, 0, 239, 50}, 419},
        {"exactly as wide, not at the origin", {4, 0, 240, 44}, {100, 18}, {80, 18}, {14, 13, 100, 18},
            {164, 13, 80, 18}, {4, 0, 240, 50}, 240},
        {"bounds not at the origin", {4, 6, 300, 44}, {30, 17}, {400, 18}, {14, 13.5, 30, 17},
            {94, 13, 400, 18}, {4, 6, 300, 50}, 730},
        {"empty texts", {0, 0, 300, 44}, {0, 18}, {0, 18}, {10, 13, 0, 18}, {300, 13, 0, 18}, {0, 0, 300, 50},
            300},
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

// 10 points are kept free at the right of a row.
constexpr int kRowWidth = 375;
constexpr int kContentWidth = kRowWidth - 10;

TEST(OrvexCell, MeasuresTheValueInTheBoldFont)
{
    OrvexCell cell(OrvexCell::Kind::leaf, "cell");
    cell.resize(kRowWidth, 44);
    cell.setKey("Cell ID");
    cell.setValue("0x01A2B3C4 (27)");
    cell.setLayout();

    const QSize bold = sizeOfLine("0x01A2B3C4 (27)", Theme::boldSystemFont(15));
    ASSERT_GT(bold.width(), sizeOfLine("0x01A2B3C4 (27)", Theme::systemFont(15)).width());
    EXPECT_FALSE(cell.value()->font().bold());
    EXPECT_TRUE(cell.key().font().bold());
    EXPECT_EQ(cell.value()->geometry(),
        QRect(kContentWidth - bold.width(), (44 - bold.height()) / 2, bold.width(), bold.height()));
    EXPECT_EQ(cell.view()->geometry(), QRect(0, 0, kContentWidth, 50));
    EXPECT_EQ(cell.view()->maximumOffset(), 0);
    EXPECT_EQ(cell.accessibleName(), "Cell ID, 0x01A2B3C4 (27)");
}

TEST(OrvexCell, ScrollsALongValueByBothWidthsAndFollowsResizing)
{
    OrvexCell cell(OrvexCell::Kind::leaf, "cell");
    cell.setKey("Measurement Rules");
    cell.setValue(QString(60, 'x'));
    cell.setLayout();
    cell.resize(kRowWidth, 44);
    cell.show();

    const int keyWidth = sizeOfLine("Measurement Rules", Theme::boldSystemFont(15)).width();
    const int valueWidth = sizeOfLine(QString(60, 'x'), Theme::boldSystemFont(15)).width();
    EXPECT_EQ(cell.value()->x(), 10 + keyWidth + 50);
    EXPECT_EQ(cell.view()->maximumOffset(), keyWidth + valueWidth);
    cell.view()->setOffset(100'000);
    EXPECT_EQ(cell.view()->offset(), keyWidth + valueWidth);

    cell.resize(2000, 44);
    EXPECT_EQ(cell.value()->x(), 2000 - 10 - valueWidth);
    EXPECT_EQ(cell.view()->offset(), 0);
}

TEST(OrvexCell, ShowsTextsFromTheAirAsOnePlainLine)
{
    OrvexCell cell(OrvexCell::Kind::leaf, "cell");
    cell.setKey("Name");
    cell.setValue("<b>One</b>\nTwo");
    EXPECT_EQ(cell.value()->text(), "<b>One</b> Two");
    EXPECT_EQ(cell.value()->textFormat(), Qt::PlainText);
}

} // namespace
} // namespace orvex::test
