#include "StatusPrinter.h"
#include "OrvexApp.h"

#include "PaneFixture.h"
#include "RecordingOutput.h"
#include "SessionFixture.h"

namespace orvex::test {
namespace {

struct StatusPrinterTest : testing::Test, SessionFixture {
    // What was printed since the last call, with all that is to be drawn drawn.
    std::string printed()
    {
        QCoreApplication::processEvents();
        return output.take();
    }

    std::shared_ptr<OrvexApp> app = OrvexApp::create(platform());
    RecordingOutput output;
    StatusPrinter printer{*app, output};
};

TEST_F(StatusPrinterTest, PrintsTheStatusLineOnScreenWhenItChanges)
{
    app->applicationDidFinishLaunching();
    runLoop.runPosted();
    QCoreApplication::processEvents();
    EXPECT_EQ(printed(), "0 Connecting...\n");
    deliverNeighbors(1);
    deliverNeighbors(2);
    EXPECT_EQ(printed(), "");
    refresh();
    EXPECT_EQ(printed(), "2 Updated 2023-11-15 at 00:13:20\n");

    deliverNeighbors(3);
    refresh(); // at the same time
    EXPECT_EQ(printed(), "");
    clock.moment.secondsSince1970 += 2;
    deliverNeighbors(3);
    loseService();
    refresh();
    EXPECT_EQ(printed(), "4 Connecting...\n");

    app->applicationWillTerminate();
    EXPECT_EQ(printed(), "");
}

TEST_F(StatusPrinterTest, PrintsWhatTheScreenOnTopShows)
{
    app->applicationDidFinishLaunching();
    runLoop.runPosted();
    deliverNeighbors(1);
    refresh();
    printed();
    loseService();
    refresh(); // nothing is drawn without a message
    EXPECT_EQ(printed(), "");
    tapRow(paneAt(*app->navigationStack(), 0).tableList(), 1);
    EXPECT_EQ(printed(), "1 Connecting...\n");
}

} // namespace
} // namespace orvex::test
