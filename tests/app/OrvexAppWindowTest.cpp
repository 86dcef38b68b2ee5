// The session's window where it says more than its rows: silence, saving, nobody looking.

#include "OrvexApp.h"
#include "OrvexSaveViewController.h"

#include "PaneFixture.h"
#include "SessionFixture.h"

#include "Bar.h"
#include "Notice.h"
#include "Storage.h"
#include "Veil.h"

#include <QLineEdit>
#include <QWindow>

#include <filesystem>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

struct OrvexAppWindowTest : testing::Test, SessionFixture {
    OrvexAppWindowTest()
    {
        std::filesystem::create_directories(paths::internalBuildMarker());
        app->applicationDidFinishLaunching();
        runLoop.runPosted();
        deliverNeighbors(1);
        refresh();
    }
    ~OrvexAppWindowTest() override { std::filesystem::remove_all(paths::internalBuildMarker()); }

    template <typename Widget>
    static std::vector<Widget*> childrenOf(const QObject& parent)
    {
        std::vector<Widget*> result;
        for (QObject* child : parent.children()) {
            if (auto* const found = dynamic_cast<Widget*>(child))
                result.push_back(found);
        }
        return result;
    }
    TableList& neighbors() const { return paneAt(*app->navigationStack(), 1).tableList(); }

    std::shared_ptr<OrvexApp> app = OrvexApp::create(platform());
};

TEST_F(OrvexAppWindowTest, DimsRowsAfterTenSecondsOfSilence)
{
    const Veil& veil = *childrenOf<Veil>(*app->navigationStack()).at(0);
    const auto isDimmedAfter = [&](std::chrono::milliseconds time) {
        runLoop.advance(time);
        return veil.isVisible();
    };
    EXPECT_FALSE(isDimmedAfter(9900ms));
    EXPECT_TRUE(isDimmedAfter(200ms));
    deliverNeighbors(1);
    EXPECT_FALSE(isDimmedAfter(2s));
    EXPECT_TRUE(isDimmedAfter(10s));
    app->applicationWillTerminate();
    runLoop.advance(20s);
}

TEST_F(OrvexAppWindowTest, ShowsWhereItHasSaved)
{
    for (const char* again : {"once", "twice"}) {
        app->showSaveView();
        static_cast<OrvexSaveViewController&>(*app->saveViewController()).savePressed();
        runLoop.runPosted();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        const auto notices = childrenOf<Notice>(*app->window());
        ASSERT_EQ(notices.size(), 1U) << again;
        EXPECT_EQ(notices[0]->text().toStdString(),
            "Saved " + paths::diagnosticReports() + "/OrvexSnapshot-1700000000.orvex");
        EXPECT_TRUE(app->window()->rect().contains(notices[0]->geometry()));
    }
}

TEST_F(OrvexAppWindowTest, UpdatesItsScreensWhenSomebodyLooksAgain)
{
    tapRow(paneAt(*app->navigationStack(), 0).tableList(), 1);
    ASSERT_EQ(neighbors().rowCount(), 1);
    app->window()->windowHandle()->setVisible(false);
    QCoreApplication::processEvents();
    deliverNeighbors(2);
    refresh();
    EXPECT_EQ(neighbors().rowCount(), 1) << "nobody can see it";
    app->window()->windowHandle()->setVisible(true);
    EXPECT_TRUE(QTest::qWaitFor([&] { return neighbors().rowCount() == 2; }));
}

} // namespace
} // namespace orvex::test
