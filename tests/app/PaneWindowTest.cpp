// What one does with the list screens beyond tapping rows: copying, finding, going back, typing names.

#include "PaneWindow.h"

#include "FileDrop.h"
#include "FindScreen.h"
#include "FoundRowCell.h"
#include "PaneFixture.h"

#include "TypeAhead.h"
#include "Window.h"

#include <QClipboard>
#include <QContextMenuEvent>
#include <QDropEvent>
#include <QMenu>
#include <QMimeData>
#include <QUrl>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

struct PaneWindowTest : testing::Test {
    PaneWindowTest()
    {
        panes.window().show();
        QApplication::setActiveWindow(&panes.window());
        panes.stack().setFocus();
        QGuiApplication::clipboard()->clear();
    }

    OrvexPaneController& top() const { return static_cast<OrvexPaneController&>(panes.stack().topScreen()); }
    TableList& list() const { return top().tableList(); }
    // Presses the keys where the focus is.
    static void press(int key, Qt::KeyboardModifiers modifiers = {})
    {
        QTest::keyClick(QApplication::focusWidget(), static_cast<Qt::Key>(key), modifiers);
        QCoreApplication::processEvents();
    }
    std::string clipboard() const { return QGuiApplication::clipboard()->text().toStdString(); }
    void swipe(QPoint from, QPoint to)
    {
        QTest::mousePress(&list(), Qt::LeftButton, {}, from);
        QTest::mouseMove(&list(), to);
        QTest::mouseRelease(&list(), Qt::LeftButton, {}, to);
        QCoreApplication::processEvents();
    }

    const Tree tree{rows({{"Serving", rows({{"RSRP", "-75.50 dBm"}, {"RSRQ", "-9\tdB"}, {"Band", "20"}})},
        {"Neighbours", Array::make({rows({{"PCI", "75"}}), rows({{"PCI", "12"}})})}})};
    FakePaneHost host;
    PaneWindow panes{
        "Orvex", QSize(375, 667), host, std::make_unique<OrvexPaneController>(host, tree.root, "/")};
};

TEST_F(PaneWindowTest, CopiesARowOrTheScreen)
{
    press(Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(clipboard(), "Serving\nNeighbours\n") << "no row selected";
    tapRow(list(), 0);
    tapRow(list(), 0); // a leaf, which does not stay selected
    press(Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(clipboard(), "RSRP\t-75.50 dBm");
    press(Qt::Key_C, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(clipboard(), "RSRP\t-75.50 dBm\nRSRQ\t-9\\tdB\nBand\t20\n");
}

TEST_F(PaneWindowTest, AMenuCopiesTheRowItWasAskedFor)
{
    const auto chooseCopy = [] {
        auto* const menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
        ASSERT_TRUE(menu);
        menu->actions().at(0)->trigger();
        menu->close();
    };
    QTest::mousePress(&list(), Qt::LeftButton, {}, QPoint(50, 5));
    EXPECT_TRUE(QTest::qWaitFor([] { return QApplication::activePopupWidget() != nullptr; }, 2000));
    chooseCopy();
    EXPECT_EQ(clipboard(), "Serving");
    QTest::mouseRelease(&list(), Qt::LeftButton, {}, QPoint(50, 5));
    EXPECT_EQ(panes.stack().count(), 1) << "a long press is no tap";

    tapRow(list(), 0);
    QContextMenuEvent click(QContextMenuEvent::Mouse, QPoint(50, 44 * 2 + 5), QPoint(50, 50));
    QApplication::sendEvent(&list(), &click);
    chooseCopy();
    EXPECT_EQ(clipboard(), "Band\t20");
}

TEST_F(PaneWindowTest, ShortcutsGoBackAndSave)
{
    tapRow(list(), 0);
    press(Qt::Key_Left, Qt::AltModifier);
    EXPECT_EQ(panes.stack().count(), 1);
    press(Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(host.savesAsked, 0) << "not offered";
    host.offersSave = true;
    press(Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(host.savesAsked, 1);
}

TEST_F(PaneWindowTest, ASwipeFromTheEdgeGoesBack)
{
    const std::tuple<const char*, QPoint, QPoint, int> cases[] = {
        {"not from the edge", {25, 100}, {200, 100}, 2},
        {"too short", {5, 100}, {60, 100}, 2},
        {"down", {5, 100}, {120, 300}, 2},
        {"from the edge", {5, 100}, {120, 110}, 1},
    };
    tapRow(list(), 0);
    for (const auto& [name, from, to, count] : cases) {
        swipe(from, to);
        EXPECT_EQ(panes.stack().count(), count) << name;
    }
    swipe({5, 20}, {200, 20});
    EXPECT_EQ(panes.stack().count(), 1) << "a swipe on the root is no tap either";
}

TEST_F(PaneWindowTest, TypingGoesToTheRowOfThatName)
{
    tapRow(list(), 0);
    const std::pair<const char*, int> steps[] = {{"r", 0}, {"r", 1}, {"r", 0}};
    for (const auto& [letter, row] : steps) {
        QTest::keyClicks(&list(), letter);
        EXPECT_EQ(list().selectedRow(), row);
    }
    TypeAhead typed;
    const TypeAhead::Clock::time_point start{};
    const auto rowAfter = [&](const char* character, std::chrono::milliseconds time) {
        const char* const names[] = {"Band", "bandwidth", "Barred", "x"};
        typed.type(character, start + time);
        return typed.row(4, 0, [&](int row) { return QString(names[row]); });
    };
    EXPECT_EQ(rowAfter("b", 0ms), 1);
    EXPECT_EQ(rowAfter("a", 900ms), 0);
    EXPECT_EQ(rowAfter("r", 1800ms), 2);
    EXPECT_EQ(rowAfter("x", 2800ms), std::nullopt);
    EXPECT_EQ(rowAfter("x", 3801ms), 3) << "after a pause";
}

TEST_F(PaneWindowTest, FindsARowAndGoesThere)
{
    tapRow(list(), 1);
    press(Qt::Key_F, Qt::ControlModifier);
    const auto* const find = dynamic_cast<FindScreen*>(panes.window().modalScreen());
    ASSERT_TRUE(find);
    QTest::keyClicks(&find->field(), "75");
    ASSERT_EQ(find->results().rowCount(), 2);
    const auto shown = [&](int row) {
        const auto& cell = static_cast<const FoundRowCell&>(*find->results().cellAtRow(row));
        return (cell.place().text() + ": " + cell.name().text() + "=" + cell.value().text()).toStdString();
    };
    EXPECT_EQ(shown(0), "Serving: RSRP=-75.50 dBm");
    EXPECT_EQ(shown(1), "Neighbours / 0: PCI=75");
    press(Qt::Key_Down);
    press(Qt::Key_Down);
    press(Qt::Key_Return);
    EXPECT_EQ(pathsOn(panes.stack()), (std::vector<std::string>{"/", "/Neighbours", "/Neighbours/0"}));
    EXPECT_EQ(list().selectedRow(), 0);

    press(Qt::Key_F, Qt::ControlModifier);
    press(Qt::Key_Return); // nothing found yet
    EXPECT_TRUE(panes.window().modalScreen());
    QTest::keyClicks(QApplication::focusWidget(), "band");
    press(Qt::Key_Return); // the first
    EXPECT_EQ(pathsOn(panes.stack()), (std::vector<std::string>{"/", "/Serving"}));
    press(Qt::Key_F, Qt::ControlModifier);
    press(Qt::Key_Escape);
    EXPECT_FALSE(panes.window().modalScreen());
    panes.goTo({{"Neighbours", "7", "PCI"}, nullptr}); // the tree may have changed meanwhile
    EXPECT_EQ(pathsOn(panes.stack()), (std::vector<std::string>{"/", "/Neighbours"}));
}

TEST(FileDrop, TakesLocalFilesAlone)
{
    QWidget window;
    std::string files;
    FileDrop drop(window, [&files](const std::string& path) { files += path + '|'; });
    QMimeData data;
    data.setUrls({QUrl("https://example.org/a"), QUrl::fromLocalFile("/a b"), QUrl::fromLocalFile("/c")});
    QDropEvent event({}, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    EXPECT_TRUE(drop.eventFilter(&window, &event)); // the application passes it on only after a drag
    EXPECT_EQ(files, "/a b|/c|");
    data.setUrls({QUrl("https://example.org/a")});
    EXPECT_FALSE(drop.eventFilter(&window, &event));
}

} // namespace
} // namespace orvex::test
