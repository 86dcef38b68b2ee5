#include "OrvexApp.h"

#include "PaneFixture.h"
#include "SessionFixture.h"

#include "FixedPaths.h"

#include <QApplication>
#include <QTemporaryDir>

#include <cstdlib>
#include <ctime>
#include <filesystem>
#include <fstream>

namespace orvex::test {
namespace {

// Sets an environment variable while it lives.
class Environment {
public:
    Environment(const char* name, const std::string& value)
        : _name(name)
    {
        qputenv(name, QByteArray::fromStdString(value));
        ::tzset();
    }
    ~Environment()
    {
        qunsetenv(_name);
        ::tzset();
    }
    Environment(const Environment&) = delete;
    Environment& operator=(const Environment&) = delete;

private:
    const char* _name;
};

class OrvexAppTest : public testing::Test, public SessionFixture {
protected:
    OrvexPaneController& pane(int index) const { return paneAt(*app->navigationStack(), index); }
    // "status" of the screen on top, with "..." of its own while it is loading.
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

    Environment root{"ORVEX_ROOT", directory.path().toStdString()};
    Environment zone{"TZ", "XYZ-02"};
    std::shared_ptr<OrvexApp> app = OrvexApp::create(platform());

    static inline const QTemporaryDir directory;
};

TEST_F(OrvexAppTest, LaunchesBeforeItStartsTheSession)
{
    app->applicationDidFinishLaunching();
    EXPECT_EQ(telephony.localPortsCreated, 0);
    EXPECT_EQ(app->window()->size(), QSize(375, 667));
    EXPECT_EQ(app->window()->windowTitle(), "Orvex");
    EXPECT_TRUE(app->window()->isVisible());
    EXPECT_EQ(pane(0).title(), "Orvex");
    EXPECT_EQ(pane(0).tableList().rowCount(), 0);
    EXPECT_EQ(status(), "[busy] Connecting");
    EXPECT_EQ(app->updateMessage(), "Connecting...");
    EXPECT_FALSE(app->allowSaveButton());
    runLoop.runPosted();
    EXPECT_EQ(telephony.localPortsCreated, 1);
    EXPECT_EQ(status(), "[busy] Connecting"); // until the first data
}

TEST_F(OrvexAppTest, SaysWhenItWasUpdatedInLocalTime)
{
    launch();
    deliverNeighbors(2);
    refresh();
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:20");
    EXPECT_EQ(pane(0).tableList().rowCount(), 2);
    clock.moment.secondsSince1970 += 2;
    refresh(); // nothing has arrived
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:20");
    tapRow(pane(0).tableList(), 0);
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:20");
    EXPECT_EQ(shownAt(pane(1), 1), "E-ARFCN=6300");
}

TEST_F(OrvexAppTest, SaysThatItConnectsFromTheNextRefreshOrNavigationAfterALoss)
{
    launch();
    deliverNeighbors(2);
    refresh();
    loseService();
    refresh();
    EXPECT_FALSE(app->model()->isConnected());
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:20");
    tapRow(pane(0).tableList(), 1);
    EXPECT_EQ(status(), "[busy] Connecting...");
    app->updateViewControllerFromModel();
    EXPECT_EQ(status(), "[busy] Connecting...");

    telephony.serviceIsAbsent = false;
    runLoop.advance(std::chrono::seconds(5));
    ASSERT_TRUE(app->model()->isConnected());
    app->navigationStack()->pop(false);
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:20"); // of the last data
}

TEST_F(OrvexAppTest, LeavesAScreenWhoseRowIsGone)
{
    launch();
    deliverNeighbors(2);
    refresh();
    tapRow(pane(0).tableList(), 1);
    tapRow(pane(1).tableList(), 1);
    EXPECT_EQ(pathsOn(*app->navigationStack()),
        (std::vector<std::string>{"/", "/Neighbor Cells List", "/Neighbor Cells List/1"}));
    clock.moment.secondsSince1970 += 2;
    deliverNeighbors(1);
    refresh();
    EXPECT_EQ(pathsOn(*app->navigationStack()), (std::vector<std::string>{"/", "/Neighbor Cells List"}));
    EXPECT_EQ(pane(1).tableList().rowCount(), 1);
    EXPECT_EQ(status(), "Updated 2023-11-15 at 00:13:22");
}

TEST_F(OrvexAppTest, OffersTheSaveButtonOnInternalBuildsOnceThereIsAScreenForIt)
{
    const std::filesystem::path marker = paths::internalBuildMarker();
    std::filesystem::create_directories(marker.parent_path());
    std::ofstream(marker).put('\n');

    app->getSaveButtonPref();
    EXPECT_TRUE(app->allowSaveButton());
    EXPECT_FALSE(app->offersSaveButton());
    std::vector<ArrayRef> opened;
    app->setSaveScreenFactory([&opened](const ArrayRef& contents) {
        opened.push_back(contents);
        return std::make_unique<Screen>();
    });
    EXPECT_TRUE(app->offersSaveButton());

    launch();
    deliverNeighbors(1);
    refresh();
    QTest::mouseClick(pane(0).toolbarRow()->items().back().widget, Qt::LeftButton);
    app->showSaveView();
    ASSERT_EQ(opened.size(), 1U);
    ASSERT_TRUE(opened[0]);
    EXPECT_FALSE(opened[0]->isEmpty());
    EXPECT_TRUE(app->saveViewController()->isVisible());
    EXPECT_FALSE(app->navigationStack()->isVisible());
    app->closeSaveView();
    app->closeSaveView();
    EXPECT_EQ(app->saveViewController(), nullptr);
    EXPECT_TRUE(app->navigationStack()->isVisible());

    std::filesystem::remove(marker);
    app->getSaveButtonPref();
    EXPECT_FALSE(app->allowSaveButton());
}

TEST_F(OrvexAppTest, TerminatesOnceAndLeavesNothingRunning)
{
    launch();
    deliverNeighbors(1); // an update is under way
    app->applicationWillTerminate();
    app->applicationWillTerminate();
    EXPECT_EQ(preferences.done, kHomeScreenWrite);
    EXPECT_EQ(app->window(), nullptr);
    EXPECT_EQ(app->updateMessage(), std::nullopt);
    EXPECT_FALSE(telephony.localPort->valid);
    EXPECT_EQ(runLoop.timerCount(), 0U);
    refresh();
}

TEST_F(OrvexAppTest, TerminatesBeforeTheSessionStartedAndWhileARetryWaits)
{
    app->applicationDidFinishLaunching();
    app->applicationWillTerminate();
    runLoop.runPosted();
    EXPECT_EQ(telephony.localPortsCreated, 0);

    telephony.serviceIsAbsent = true;
    app = OrvexApp::create(platform());
    launch();
    ASSERT_EQ(runLoop.delayedCount(), 1U);
    app->applicationWillTerminate();
    app.reset();
    telephony.serviceIsAbsent = false;
    runLoop.advance(std::chrono::seconds(5));
    deliverNeighbors(1);
    refresh(); // the waiting retry kept the session, but it has nobody to tell
}

} // namespace
} // namespace orvex::test
