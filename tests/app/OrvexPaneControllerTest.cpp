#include "PaneFixture.h"

#include "Bar.h"
#include "Indicators.h"

#include <QApplication>

#include <set>

namespace orvex::test {
namespace {

using Paths = std::vector<std::string>;

Tree lteTree()
{
    return Tree(rows({
        {"Serving Cell Info", rows({})},
        {"Neighbor Cells List", Array::make({rows({}), rows({})})},
        {"RRC State", "Connected"},
    }));
}

using OrvexPaneControllerTest = PaneFixture;

TEST_F(OrvexPaneControllerTest, ShowsThatItIsBusyWhileItIsSeen)
{
    show(Tree(rows({})));
    top().setStatus("Updated", false);
    EXPECT_EQ(top().toolbarRow()->items().size(), 3U) << "no button where saving is not offered";
    EXPECT_TRUE(top().toolbarRow()->items()[0].widget->isHidden());
    EXPECT_EQ(static_cast<TextLabel*>(top().toolbarRow()->items()[1].widget)->text(), "Updated");
    top().setStatus(std::nullopt, true);
    const auto& items = top().toolbarRow()->items();
    EXPECT_EQ(static_cast<TextLabel*>(items[1].widget)->text(), "");
    EXPECT_TRUE(static_cast<ActivityIndicator*>(items[0].widget)->isTicking());
    stack->hide();
    EXPECT_FALSE(static_cast<ActivityIndicator*>(items[0].widget)->isTicking());
}

TEST_F(OrvexPaneControllerTest, OpensBranchesByTapAndByKeyAndComesBack)
{
    show(lteTree());
    top().setStatus("Updated", false);
    tapRow(top().tableList(), 1);
    EXPECT_EQ(top().status(), "Updated");
    EXPECT_EQ(stack->navigationBar().title(), "Neighbor Cells List");
    EXPECT_EQ(paneAt(*stack, 0).tableList().selectedRow(), 1);
    for (const auto pressed : {Qt::Key_Down, Qt::Key_Down, Qt::Key_Return})
        key(pressed);
    EXPECT_EQ(pathsOn(*stack), (Paths{"/", "/Neighbor Cells List", "/Neighbor Cells List/1"}));
    EXPECT_EQ(top().tableList().rowCount(), 0); // a branch without children
    key(Qt::Key_Escape);
    EXPECT_TRUE(top().toolbarRow()->isVisible());
    EXPECT_FALSE(paneAt(*stack, 0).toolbarRow()->isVisible());
    key(Qt::Key_Escape);
    EXPECT_EQ(QApplication::focusWidget(), &top().tableList());

    tapRow(top().tableList(), 2); // a leaf
    top().didSelectRow(top().tableList(), std::nullopt);
    EXPECT_EQ(pathsOn(*stack), Paths{"/"});
    EXPECT_EQ(top().tableList().selectedRow(), std::nullopt);
}

TEST_F(OrvexPaneControllerTest, AReusedCellKeepsTheKindItWasMadeAs)
{
    show(Tree(rows({{"A", rows({})}, {"B", "leaf"}})));
    reload(Tree(rows({{"A", "value"}, {"B", rows({})}})));
    // The branch cell has no label for a value.
    EXPECT_EQ(shownAt(top(), 0), "A");
    EXPECT_EQ(top().tableList().cellAtRow(0)->accessory(), TableCell::Accessory::none);
    EXPECT_EQ(shownAt(top(), 1), "B");
    EXPECT_EQ(top().tableList().cellAtRow(1)->accessory(), TableCell::Accessory::disclosureIndicator);
}

TEST_F(OrvexPaneControllerTest, PopsTheFirstScreenWhosePathIsGone)
{
    const std::pair<Value, Paths> cases[] = {
        {rows({{"Z", "new"}, {"A", rows({{"B", rows({{"C", "new"}})}})}}), {"/", "/A", "/A/B"}},
        {rows({{"Z", "new"}, {"A", "a leaf now"}}), {"/", "/A"}},
        {rows({{"Z", "new"}}), {"/"}},
        {Value(), {"/"}},
    };
    for (const auto& [display, paths] : cases) {
        show(Tree(rows({{"Z", "old"}, {"A", rows({{"B", rows({{"C", "old"}})}})}})));
        tapRow(top().tableList(), 1);
        tapRow(top().tableList(), 0);
        ASSERT_EQ(pathsOn(*stack), (Paths{"/", "/A", "/A/B"}));
        reload(Tree(display));
        EXPECT_EQ(pathsOn(*stack), paths);
        EXPECT_EQ(shownAt(paneAt(*stack, 0), 0), display.isNull() ? "(no cell)" : "Z=new");
    }
}

TEST_F(OrvexPaneControllerTest, AReloadKeepsTheHighlightOnTheRowOfTheSameName)
{
    const Value branch = rows({});
    const std::pair<Tree, std::optional<int>> cases[] = {
        // and the row of B
        {Tree(rows({{"New", branch}, {"A", branch}, {"B", branch}})), 2},
        {Tree(rows({{"B", branch}})), 0},
        {Tree(rows({{"A", branch}, {"C", branch}})), std::nullopt},
    };
    for (const auto& [tree, expected] : cases) {
        for (const bool isPressed : {false, true}) {
            show(Tree(rows({{"A", branch}, {"B", branch}})));
            TableList& list = top().tableList();
            if (isPressed)
                QTest::mousePress(&list, Qt::LeftButton, {}, {60, 66});
            else
                list.selectRow(1);
            reload(tree);
            for (int row = 0; row < list.rowCount(); ++row)
                EXPECT_EQ(list.cellAtRow(row)->isHighlighted(), row == expected) << row << isPressed;
            QTest::mouseRelease(&list, Qt::LeftButton, {}, {60, 66});
            EXPECT_EQ(top().path(), isPressed && expected ? "/B" : "/");
        }
    }
}

TEST_F(OrvexPaneControllerTest, TabReachesBackButtonListAndSave)
{
    using Widgets = std::set<const QWidget*>;
    host.offersSave = true;
    show(lteTree());
    for (const auto tab : {Qt::Key_Tab, Qt::Key_Backtab}) {
        const auto reached = [this, tab] {
            Widgets widgets;
            for (int step = 0; step < 8; ++step) {
                QTest::keyClick(QApplication::focusWidget(), tab);
                widgets.insert(QApplication::focusWidget());
            }
            EXPECT_TRUE(widgets.contains(top().toolbarRow()->items().back().widget));
            EXPECT_TRUE(widgets.contains(&top().tableList()));
            return widgets;
        };
        EXPECT_EQ(reached().size(), 2U);
        tapRow(top().tableList(), 1);
        EXPECT_EQ(reached().size(), 3U);
        EXPECT_TRUE(reached().contains(&stack->navigationBar().backButton()));
        stack->pop(false);
    }
}

TEST_F(OrvexPaneControllerTest, APressThatEndsAfterItsScreenWasPoppedOrCoveredOpensNothing)
{
    for (const bool isPopped : {true, false}) {
        show(Tree(rows({{"A", rows({{"B", rows({})}})}})));
        tapRow(top().tableList(), 0);
        TableList& list = top().tableList();
        QTest::mousePress(&list, Qt::LeftButton, {}, {60, 20});
        if (isPopped) {
            reload(Tree(rows({{"C", "value"}})));
        } else {
            list.selectRow(0);
            key(Qt::Key_Return);
        }
        const Paths paths = isPopped ? Paths{"/"} : Paths{"/", "/A", "/A/B"};
        EXPECT_EQ(pathsOn(*stack), paths);
        QTest::mouseRelease(&list, Qt::LeftButton, {}, {60, 20});
        EXPECT_EQ(pathsOn(*stack), paths);
    }
}

TEST_F(OrvexPaneControllerTest, KeepsItsRowsUntilItIsReloaded)
{
    show(lteTree()); // whose Tree is deleted at once
    top().tableList().reloadData();
    EXPECT_EQ(shownAt(top(), 2), "RRC State=Connected");
    reloadPanes(*stack, nullptr, [](const std::string&) { return nullptr; });
    EXPECT_EQ(top().title(), "Orvex");
    EXPECT_EQ(top().tableList().rowCount(), 0);
}

} // namespace
} // namespace orvex::test
