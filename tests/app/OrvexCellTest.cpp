#include "OrvexCell.h"

#include "TextLabel.h"
#include "Theme.h"

#include <QImage>

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
    EXPECT_EQ(cell.value()->x(), 2000 - 10 - valueWidth); // 10 points stay free at the right
    EXPECT_EQ(cell.view()->offset(), 0);
}

TEST(OrvexCell, ShowsNetworkTextAsOnePlainLine)
{
    OrvexCell cell(OrvexCell::Kind::leaf, "cell");
    cell.setKey("Name");
    cell.setValue("<b>One</b>\nTwo");
    EXPECT_EQ(cell.value()->text(), "<b>One</b> Two");
    EXPECT_EQ(cell.value()->textFormat(), Qt::PlainText);
    EXPECT_EQ(cell.accessibleName(), "Name, <b>One</b> Two");
}

TEST(OrvexCell, PaintsHighlightAccessoriesAndTheMarkOfHiddenText)
{
    using Accessory = TableCell::Accessory;
    const auto painted = [](Accessory accessory, bool isHighlighted, int valueLength = 1) {
        OrvexCell cell(OrvexCell::Kind::leaf, "cell");
        cell.setValue(QString(valueLength, ' ')); // only its length is to be seen
        cell.setAccessory(accessory);
        cell.setHighlighted(isHighlighted);
        cell.setLayout();
        cell.resize(200, 44);
        return cell.grab().toImage();
    };
    const auto pixelsOf = [](const QImage& image, const QColor& color) {
        int count = 0;
        for (int x = 0; x < image.width(); ++x) {
            for (int y = 0; y < image.height(); ++y)
                count += image.pixelColor(x, y) == color ? 1 : 0;
        }
        return count;
    };
    std::vector<QColor> backgrounds;
    for (const auto mode : {Theme::Mode::dark, Theme::Mode::light}) {
        Theme::use(mode);
        const Theme& theme = Theme::current();
        backgrounds.push_back(theme.background);
        const QImage plain = painted(Accessory::none, false);
        EXPECT_EQ(pixelsOf(plain, theme.separator), 190);
        EXPECT_EQ(pixelsOf(plain, theme.tint), 0);
        EXPECT_EQ(pixelsOf(plain, theme.accessory), 0);
        EXPECT_EQ(pixelsOf(painted(Accessory::none, true), theme.rowHighlight), 200 * 44 - 190);
        EXPECT_GT(pixelsOf(painted(Accessory::checkmark, false), theme.tint), 10);
        EXPECT_GT(pixelsOf(painted(Accessory::disclosureIndicator, false), theme.accessory), 5);
        EXPECT_NE(painted(Accessory::none, false, 200), plain);
    }
    EXPECT_LT(backgrounds[0].lightness(), backgrounds[1].lightness());
}

} // namespace
} // namespace orvex::test
