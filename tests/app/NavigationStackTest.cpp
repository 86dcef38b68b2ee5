#include "NavigationStack.h"

#include "Bar.h"
#include "Toolbar.h"

#include <QApplication>
#include <QPointer>
#include <QTest>

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

class NavigationStackTest : public testing::Test {
public:
    NavigationStackTest()
    {
        stack.resize(300, 400);
        stack.show();
        QApplication::setActiveWindow(&stack);
    }
    ~NavigationStackTest() override { setAnimationsEnabled(false); }

    static std::unique_ptr<Screen> screen(const char* title)
    {
        auto result = std::make_unique<Screen>();
        result->setTitle(title);
        return result;
    }

    NavigationStack stack{screen("Root")};
};

TEST_F(NavigationStackTest, BackButtonAndKeysPopAllButTheRoot)
{
    BarButton& back = stack.navigationBar().backButton();
    EXPECT_TRUE(back.isHidden());
    for (const char* title : {"A", "B", "C", "D"})
        stack.push(screen(title), true);
    for (const int nowhere : {5, 4, -1})
        stack.popTo(nowhere, true);
    EXPECT_EQ(stack.navigationBar().title(), "D");
    stack.popTo(2, true);
    EXPECT_EQ(stack.navigationBar().title(), "B");
    stack.screenAt(1).setTitle("A2");
    EXPECT_EQ(back.text(), "A2");
    EXPECT_EQ(back.accessibleName(), "Back to A2");
    QTest::mouseClick(&back, Qt::LeftButton);
    EXPECT_EQ(stack.navigationBar().title(), "A2");
    for (const auto key : {Qt::Key_Escape, Qt::Key_Backspace, Qt::Key_Back}) {
        for (int time = 0; time < 2; ++time)
            QTest::keyClick(&stack.topScreen(), key);
        EXPECT_EQ(stack.count(), 1);
        EXPECT_TRUE(back.isHidden());
        stack.push(screen("A"), false);
    }
}

TEST_F(NavigationStackTest, APushOrAResizeFinishesARunningSlide)
{
    setAnimationsEnabled(true);
    Screen& root = stack.topScreen();
    stack.push(screen("A"), true);
    const QPointer<Screen> a = &stack.topScreen();
    EXPECT_EQ(a->x(), 300);
    EXPECT_TRUE(QTest::qWaitFor([&] { return a->x() < 280 && root.x() < 0; }, 1000));
    stack.push(screen("B"), true);
    EXPECT_FALSE(root.isVisible());
    stack.resize(500, 700);
    EXPECT_EQ(stack.topScreen().geometry(), QRect(0, 0, 500, 700 - 44 - 44));
    EXPECT_FALSE(a->isVisible());
    stack.pop(true);
    stack.pop(true);
    EXPECT_TRUE(a->isVisible()) << "on its way out";
    EXPECT_TRUE(QTest::qWaitFor([&] { return !stack.isAnimating() && !a; }, 1000));
    EXPECT_EQ(root.geometry(), QRect(0, 0, 500, 700 - 44 - 44));
}

TEST_F(NavigationStackTest, ARefreshDuringAClickDoesNotLoseTheClick)
{
    int clicks = 0;
    const auto setItems = [&] {
        std::vector<ToolbarItem> items;
        items.push_back(ToolbarItem::button("Save", [&clicks] { ++clicks; }));
        stack.topScreen().setToolbarItems(std::move(items), true);
    };
    setItems();
    const auto button = [&] { return stack.topScreen().toolbarRow()->items().back().widget; };
    const QPointer<QWidget> pressed = button();
    QTest::mousePress(pressed, Qt::LeftButton);
    setItems();
    setItems();
    QTest::qWait(20);
    ASSERT_TRUE(pressed);
    EXPECT_NE(button(), pressed);
    QTest::mouseRelease(pressed, Qt::LeftButton);
    EXPECT_EQ(clicks, 1);
    EXPECT_TRUE(QTest::qWaitFor([&] { return !pressed; }, 1000));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(button()->parentWidget()->parentWidget()->children().size(), 1) << "old rows are deleted";
}

} // namespace
} // namespace orvex::test
