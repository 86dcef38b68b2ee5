#include "TableList.h"

#include "OrvexCell.h"
#include "TableCell.h"

#include <QApplication>
#include <QScroller>
#include <QTest>
#include <QWheelEvent>

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

class Rows final : public TableList::DataSource {
public:
    int numberOfRows(const TableList&) const override { return count; }
    std::unique_ptr<TableCell> cellForRow(TableList& list, int row) override
    {
        const std::string identifier = row % 2 == 0 ? "even" : "odd";
        if (auto cell = list.dequeueReusableCell(identifier))
            return cell;
        ++made;
        auto cell = std::make_unique<OrvexCell>(OrvexCell::Kind::leaf, identifier);
        cell->setValue(QString(200, 'x')); // wider than the list
        cell->setLayout();
        return cell;
    }
    void didSelectRow(TableList&, std::optional<int> row) override { opened.push_back(row.value_or(-1)); }

    int count = 100;
    int made = 0;
    std::vector<int> opened;
};

class TableListTest : public testing::Test {
protected:
    TableListTest()
    {
        list.resize(300, 440); // ten rows
        list.reloadData();
        list.show();
    }

    void drag(QPoint from, QPoint by)
    {
        QTest::mousePress(&list, Qt::LeftButton, {}, from);
        // Ten steps, then a rest before the release, so that nothing is flung.
        for (int step = 1; step <= 20; ++step)
            QTest::mouseMove(&list, from + by * std::min(step, 10) / 10, 25);
        QTest::qWait(200); // the scroller moves at the rate of frames, which a busy machine drops
        QTest::mouseRelease(&list, Qt::LeftButton, {}, from + by, 30);
    }
    int sidewaysAt(int row) const { return list.cellAtRow(row)->sidewaysScrollView()->offset(); }

    Rows rows;
    TableList list{rows, nullptr};
};

TEST_F(TableListTest, OnlyRowsInViewHaveCells)
{
    EXPECT_EQ(list.cellAtRow(10), nullptr);
    for (int offset = 0; offset <= list.maximumOffset(); offset += 30)
        list.setContentOffset(offset);
    EXPECT_EQ(rows.made, 12); // up to eleven in view, six of them of one kind
    EXPECT_EQ(list.cellAtRow(95)->geometry(), QRect(0, 95 * 44 - list.contentOffset(), 300, 44));

    list.setContentOffset(list.maximumOffset());
    list.resize(500, 660);
    EXPECT_EQ(list.contentOffset(), 100 * 44 - 660);
    for (int row = 85; row < 100; ++row)
        EXPECT_EQ(list.cellAtRow(row)->width(), 500);
}

TEST_F(TableListTest, AReloadGivesEachRowItsOwnCellAndScrollingResetsIt)
{
    list.setContentOffset(20); // an eleventh cell
    list.setContentOffset(0);  // spare now
    const std::vector before = {list.cellAtRow(0), list.cellAtRow(1)};
    for (int time = 0; time < 3; ++time)
        list.reloadData();
    EXPECT_EQ((std::vector{list.cellAtRow(0), list.cellAtRow(1)}), before);
    EXPECT_EQ(rows.made, 11);

    list.cellAtRow(0)->sidewaysScrollView()->setOffset(70);
    list.setContentOffset(4 * 44); // row 10 gets the spare cell
    EXPECT_EQ(list.cellAtRow(11), before[1]);
    EXPECT_EQ(list.cellAtRow(12), before[0]);
    EXPECT_EQ(sidewaysAt(12), 0);
}

TEST_F(TableListTest, AReloadKeepsOffsetAndSelectionAsFarAsTheyExist)
{
    list.setContentOffset(1000);
    list.selectRow(24);
    list.reloadData();
    EXPECT_EQ(list.contentOffset(), 1000);
    EXPECT_TRUE(list.cellAtRow(24)->isHighlighted());
    for (const auto& [count, offset] : {std::pair(20, 20 * 44 - 440), std::pair(0, 0)}) {
        rows.count = count;
        list.reloadData();
        EXPECT_EQ(list.contentOffset(), offset);
        EXPECT_EQ(list.selectedRow(), std::nullopt);
    }
    for (const auto key : {Qt::Key_Down, Qt::Key_End, Qt::Key_Return})
        QTest::keyClick(&list, key);
    EXPECT_EQ(list.selectedRow(), std::nullopt);
}

TEST_F(TableListTest, ATapOpensAndADragDoesNot)
{
    rows.count = 3;
    list.reloadData();
    QTest::mouseClick(&list, Qt::LeftButton, {}, {50, 100});
    QTest::mouseClick(&list, Qt::LeftButton, {}, {50, 400}); // below the last row
    QTest::mouseClick(&list, Qt::RightButton, {}, {50, 20});
    EXPECT_EQ(list.selectedRow(), 2);

    rows.count = 100;
    list.reloadData();
    QTest::mousePress(&list, Qt::LeftButton, {}, {50, 200});
    list.reloadData();
    EXPECT_TRUE(list.cellAtRow(4)->isHighlighted());
    QTest::mouseMove(&list, {50, 170}, 10);
    EXPECT_FALSE(list.cellAtRow(4)->isHighlighted());
    QTest::mouseRelease(&list, Qt::LeftButton, {}, {50, 170});
    EXPECT_EQ(rows.opened, (std::vector{2, -1}));
}

TEST_F(TableListTest, AGestureKeepsToItsFirstAxis)
{
    drag({150, 350}, {-30, -200});
    EXPECT_NEAR(list.contentOffset(), 190, 3); // the first ten pixels made it a drag
    EXPECT_EQ(sidewaysAt(list.contentOffset() / 44 + 7), 0);

    list.setContentOffset(440);
    drag({250, 100}, {-150, 60});
    EXPECT_EQ(list.contentOffset(), 440);
    EXPECT_EQ(sidewaysAt(11), 0);
    list.reloadData();
    EXPECT_NEAR(sidewaysAt(12), 140, 3);
    EXPECT_TRUE(rows.opened.empty());
}

TEST_F(TableListTest, APressThatStopsAFlingOpensNothing)
{
    QTest::mousePress(&list, Qt::LeftButton, {}, {150, 400});
    for (int y = 380; y > 100; y -= 40)
        QTest::mouseMove(&list, {150, y}, 10);
    QTest::mouseRelease(&list, Qt::LeftButton, {}, {150, 80}, 10);
    const int atRelease = list.contentOffset();
    EXPECT_TRUE(QTest::qWaitFor([&] { return list.contentOffset() > atRelease + 50; }, 2000));
    ASSERT_EQ(QScroller::scroller(&list)->state(), QScroller::Scrolling);
    QTest::mouseClick(&list, Qt::LeftButton, {}, {150, 200});
    const int stopped = list.contentOffset();
    QTest::qWait(60);
    EXPECT_EQ(list.contentOffset(), stopped);
    EXPECT_TRUE(rows.opened.empty());
}

TEST_F(TableListTest, TheWheelScrollsTheListOrTheRowBelowThePointer)
{
    const auto wheel = [this](QPoint angle) {
        const QPoint at(50, 100);
        QWheelEvent event(
            at, list.mapToGlobal(at), {}, angle, Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        QApplication::sendEvent(&list, &event);
    };
    wheel({0, -120});
    EXPECT_GT(list.contentOffset(), 0);
    wheel({0, 12000});
    EXPECT_EQ(list.contentOffset(), 0);
    wheel({-120, 10});
    EXPECT_GT(sidewaysAt(2), 0);
    EXPECT_EQ(sidewaysAt(1), 0);
    EXPECT_EQ(list.contentOffset(), 0);
}

TEST_F(TableListTest, KeysMoveTheSelectionThroughTheWholeList)
{
    const std::pair<Qt::Key, int> cases[] = {{Qt::Key_Down, 0}, {Qt::Key_Down, 1}, {Qt::Key_PageDown, 10},
        {Qt::Key_Up, 9}, {Qt::Key_End, 99}, {Qt::Key_Down, 99}, {Qt::Key_PageUp, 90}, {Qt::Key_Home, 0},
        {Qt::Key_Up, 0}};
    for (const auto& [key, row] : cases) {
        QTest::keyClick(&list, key);
        ASSERT_EQ(list.selectedRow(), row);
        ASSERT_NE(list.cellAtRow(row), nullptr);
        EXPECT_TRUE(list.rect().contains(list.cellAtRow(row)->geometry()));
        EXPECT_TRUE(list.cellAtRow(row)->isHighlighted());
    }
    EXPECT_FALSE(list.cellAtRow(1)->isHighlighted());
    for (const auto& [key, offset] : {std::pair(Qt::Key_Right, 40), {Qt::Key_Left, 0}}) {
        QTest::keyClick(&list, key);
        EXPECT_EQ(sidewaysAt(0), offset);
    }
    QTest::keyClick(&list, Qt::Key_Return);
    EXPECT_EQ(rows.opened, std::vector{0});
    list.deselectRow();
    QTest::keyClick(&list, Qt::Key_Down);
    EXPECT_EQ(list.selectedRow(), 1); // goes on from the deselected row
}

} // namespace
} // namespace orvex::test
