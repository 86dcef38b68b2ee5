// Letters twice the usual size.

#include "OrvexCell.h"

#include "Bar.h"
#include "TextLabel.h"
#include "Theme.h"

#include <QApplication>

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

TEST(LargeFont, RowsGrowAsFarAsNameAndValueStayInView)
{
    const QFont usual = QApplication::font();
    QFont twice = usual;
    twice.setPixelSize(30);
    QApplication::setFont(twice);
    EXPECT_EQ(Theme::fontScale(), 2);
    const std::tuple<const char*, const char*, int, int> cases[] = {
        {"Band", "20", 30, 30},
        {"Measured RSRP", "-75.50 dBm", 29, 16},
        {"Connected mode LTE Intra-frequency Measurement", "-75.50 dBm", 15, 15},
    };
    for (const auto& [name, value, largest, smallest] : cases) {
        OrvexCell cell(OrvexCell::Kind::leaf, "cell");
        cell.resize(375, 44);
        cell.setKey(name);
        cell.setValue(value);
        cell.setLayout();
        const int size = cell.key().font().pixelSize();
        EXPECT_LE(size, largest) << name;
        EXPECT_GE(size, smallest) << name;
        EXPECT_EQ(cell.value()->font().pixelSize(), size) << name;
        EXPECT_EQ(cell.view()->maximumOffset() == 0, size > 15) << name;
    }
    QApplication::setFont(usual);
}

TEST(LongTitle, ShrinksBeforeItIsCut)
{
    QWidget window;
    NavigationBar bar(&window);
    bar.resize(375, 44);
    const auto* const label = bar.findChild<QLabel*>();
    const std::tuple<QString, int, int, bool> cases[] = {
        {"Serving Cell", 17, 17, false},
        {QString(36, 'x'), 14, 16, false},
        {QString(60, 'x'), 13, 13, true},
    };
    for (const auto& [title, smallest, largest, isCut] : cases) {
        bar.setTitles(title, {}, false);
        EXPECT_GE(label->font().pixelSize(), smallest) << title.toStdString();
        EXPECT_LE(label->font().pixelSize(), largest) << title.toStdString();
        EXPECT_EQ(label->text() != title, isCut) << title.toStdString();
    }
}

} // namespace
} // namespace orvex::test
