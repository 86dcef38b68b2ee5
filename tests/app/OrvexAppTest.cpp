#include "OrvexApp.h"

#include "AppPlatform.h"
#include "ConsoleOutput.h"
#include "PaneFixture.h"
#include "SessionFixture.h"

#include "Storage.h"

#include <QLocale>
#include <QPaintEvent>
#include <QScreen>

#include <filesystem>
#include <fstream>
#include <set>

namespace orvex::test {
namespace {

// Collects every widget that is ever shown as a window of its own.
class WindowWatch final : public QObject {
public:
    WindowWatch() { qApp->installEventFilter(this); }
    bool eventFilter(QObject* watched, QEvent* event) override
    {
        const bool isWindow = watched->isWidgetType() && static_cast<QWidget*>(watched)->isWindow();
        if (event->type() == QEvent::Show && isWindow)
            shown.insert(watched);
        return false;
    }

    std::set<const QObject*> shown;
};

class OrvexAppTest : public testing::Test, public SessionFixture {
protected:
    OrvexPaneController& pane(int index) const { return paneAt(*app->navigationStack(), index); }
    // The status of the top screen, after "[busy] " while it is loading.
    std::string status() const
    {
        const auto& top = static_cast<OrvexPaneController&>(app->navigationStack()->topScreen());
        return (top.isLoading() ? "[busy] " : "") + top.status();
    }
    void launch()
    {
        app->applicationDidFinishLaunching();
        runLoop.runPosted();
    }

    std::shared_ptr<OrvexApp> app = OrvexApp::create(platform());
};

TEST_F(OrvexAppTest, OpensTheWindowBeforeItStartsTheSession)
{
    app->applicationDidFinishLaunching();
    EXPECT_EQ(telephony.localPortsCreated, 0);
    EXPECT_EQ(app->window()->size(), QGuiApplication::primaryScreen()->size());
    EXPECT_TRUE(app->window()->isVisible());
    EXPECT_EQ(status(), "[busy] Connecting");
    runLoop.runPosted();
    EXPECT_EQ(telephony.localPortsCreated, 1);
    QCoreApplication::processEvents(); // the stack announces its root
    EXPECT_EQ(status(), "Connecting...") << "connected, but without a message";
}

TEST_F(OrvexAppTest, ShowsTheTimeOfTheUpdateAndLeavesAScreenWhoseRowIsGone)
{
    launch();
    deliverNeighbors(2);
    refresh();
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:20");
    clock.moment.secondsSince1970 += 2;
    refresh(); // without a message
    tapRow(pane(0).tableList(), 1);
    tapRow(pane(1).tableList(), 1);
    EXPECT_EQ(pane(2).path(), "/Neighbor Cells List/1");
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:20");
    deliverNeighbors(1);
    refresh();
    EXPECT_EQ(pathsOn(*app->navigationStack()), (std::vector<std::string>{"/", "/Neighbor Cells List"}));
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:22");
}

TEST(UpdateMessage, UsesTheDigitsOfTheLocale)
{
    const QLocale usual;
    QLocale::setDefault(QLocale("fa_IR"));
    EXPECT_EQ(updateMessageAt(FixedClock().now()), "Updated ۲۰۲۳-۱۱-۱۵ at ۰۰:۱۳:۲۰");
    QLocale::setDefault(usual);
}

TEST_F(OrvexAppTest, ShowsAndPrintsALossAtTheNextNavigation)
{
    RecordingOutput output;
    StatusPrinter printer(*app, output);
    const WindowWatch watch;
    const auto printed = [&output] {
        QCoreApplication::processEvents(); // paint
        return output.take();
    };
    launch();
    QCoreApplication::processEvents();
    EXPECT_EQ(printed(), "0 Connecting...\n");
    deliverNeighbors(1);
    deliverNeighbors(2);
    EXPECT_EQ(printed(), "");
    refresh();
    QPaintEvent paint{QRect()};
    EXPECT_FALSE(printer.eventFilter(pane(0).toolbarRow()->items()[1].widget, &paint))
        << "it is painted still";
    EXPECT_EQ(output.take(), "2 Updated 2023-11-15 at 00:13:20\n");
    deliverNeighbors(3);
    refresh(); // at the same time
    EXPECT_EQ(printed(), "");

    loseService();
    refresh();
    EXPECT_EQ(printed(), "");
    tapRow(pane(0).tableList(), 1);
    EXPECT_EQ(status(), "[busy] Connecting...");
    EXPECT_EQ(printed(), "3 Connecting...\n");
    telephony.serviceIsAbsent = false;
    runLoop.advance(std::chrono::seconds(5));
    app->navigationStack()->pop(false);
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:20"); // of the last data
    EXPECT_EQ(watch.shown, std::set<const QObject*>{app->window()}) << "no widget is a window of its own";
}

TEST_F(OrvexAppTest, OffersTheSaveButtonOnInternalBuildsOnly)
{
    const std::filesystem::path marker = paths::internalBuildMarker();
    std::filesystem::create_directories(marker.parent_path());
    std::ofstream(marker).put('\n');
    launch();
    QTest::mouseClick(pane(0).toolbarRow()->items().back().widget, Qt::LeftButton);
    const Screen* const opened = app->saveViewController();
    ASSERT_NE(opened, nullptr);
    app->showSaveView();
    EXPECT_EQ(app->saveViewController(), opened) << "one at a time";
    EXPECT_FALSE(app->navigationStack()->isVisible());
    app->closeSaveView();
    app->closeSaveView();
    EXPECT_TRUE(app->navigationStack()->isVisible());
    std::filesystem::remove(marker);
    app->getSaveButtonPref();
    EXPECT_FALSE(app->offersSaveButton());
}

TEST_F(OrvexAppTest, TerminatesOnceAndLeavesNothingRunning)
{
    app->applicationDidFinishLaunching();
    app->applicationWillTerminate(); // before the session has started
    runLoop.runPosted();
    EXPECT_EQ(telephony.localPortsCreated, 0);

    app = OrvexApp::create(platform());
    launch();
    preferences.done.clear();
    app->applicationWillTerminate();
    app->applicationWillTerminate();
    EXPECT_EQ(preferences.done, kHomeScreenWrite);
    EXPECT_EQ(app->window(), nullptr);
    app->showSaveView(); // does nothing
    EXPECT_FALSE(telephony.localPort->valid);
    EXPECT_EQ(runLoop.timerCount(), 0U);

    telephony.serviceIsAbsent = true;
    app = OrvexApp::create(platform());
    launch();
    app.reset();
    telephony.serviceIsAbsent = false;
    runLoop.advance(std::chrono::seconds(5));
    deliverNeighbors(1);
    refresh(); // the queued retry kept the session, which must not call the deleted application
}

} // namespace
} // namespace orvex::test
