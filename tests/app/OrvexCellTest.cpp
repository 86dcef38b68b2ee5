#include "OrvexCell.h"

#include "TextLabel.h"
#include "Theme.h"

#include <QImage>

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

TEST(OrvexCell, MeasuresTheValueInTheBoldFontAndScrollsByBothWidths)
{
    OrvexCell cell(OrvexCell::Kind::leaf, "cell");
    cell.setKey("Measurement Rules");
    cell.setValue("<b>One</b>\nTwo" + QString(60, 'x'));
    cell.setLayout();
    cell.show();

    const QString line = "<b>One</b> Two" + QString(60, 'x');
    EXPECT_EQ(cell.value()->text(), line) << "networks send more than plain lines";
    EXPECT_EQ(cell.value()->textFormat(), Qt::PlainText);
    EXPECT_EQ(cell.accessibleName(), "Measurement Rules, " + line);
    EXPECT_FALSE(cell.value()->font().bold());
    const int keyWidth = sizeOfLine("Measurement Rules", Theme::boldSystemFont(15)).width();
    const int valueWidth = sizeOfLine(line, Theme::boldSystemFont(15)).width();
    ASSERT_GT(valueWidth, sizeOfLine(line, Theme::systemFont(15)).width());
    const int width = 10 + keyWidth + 50 + valueWidth + 10;
    const struct {
        int width;
        int valueLeft;
        int offset;
    } cases[] = {
        {375, 10 + keyWidth + 50, keyWidth + valueWidth},
        {2000, 2000 - 10 - valueWidth, 0}, // 10 points stay free at the right
        {width - 1, 10 + keyWidth + 50, keyWidth + valueWidth},
        {width, 10 + keyWidth + 50, 0}, // exactly as wide: nothing to scroll
    };
    for (const auto& test : cases) {
        cell.resize(test.width, 44);
        cell.view()->setOffset(100'000);
        EXPECT_EQ(cell.view()->offset(), test.offset) << test.width;
        EXPECT_EQ(cell.value()->x(), test.valueLeft) << test.width;
    }
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
    std::vector<int> lightness;
    for (const auto mode : {Theme::Mode::dark, Theme::Mode::light}) {
        Theme::use(mode);
        const Theme& theme = Theme::current();
        lightness.push_back(theme.background.lightness());
        const QImage plain = painted(Accessory::none, false);
        EXPECT_EQ(pixelsOf(plain, theme.separator), 190);
        EXPECT_EQ(pixelsOf(plain, theme.tint) + pixelsOf(plain, theme.accessory), 0);
        EXPECT_EQ(pixelsOf(painted(Accessory::none, true), theme.rowHighlight), 200 * 44 - 190);
        EXPECT_GT(pixelsOf(painted(Accessory::checkmark, false), theme.tint), 10);
        EXPECT_GT(pixelsOf(painted(Accessory::disclosureIndicator, false), theme.accessory), 5);
        EXPECT_NE(painted(Accessory::none, false, 200), plain);
    }
    EXPECT_LT(lightness[0], lightness[1]);
}

} // namespace
} // namespace orvex::test
