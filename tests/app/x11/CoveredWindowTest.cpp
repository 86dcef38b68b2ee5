// A window below others, as an X server without a compositing window manager reports it.

#include "OrvexApp.h"

#include "PaintCounter.h"
#include "PaneFixture.h"
#include "SessionFixture.h"

#include <QScreen>

namespace orvex::test {
namespace {

struct CoveredWindow : testing::Test, SessionFixture {
    CoveredWindow()
    {
        app->applicationDidFinishLaunching(); // connecting, with an indicator that turns
        EXPECT_TRUE(QTest::qWaitForWindowExposed(app->window()));
    }
    ~CoveredWindow() override { app->applicationWillTerminate(); }

    void coverWith(const QRect& area)
    {
        cover.setGeometry(area);
        cover.show();
        ASSERT_TRUE(QTest::qWaitForWindowExposed(&cover));
        QTest::qWait(100); // what was to be painted is
    }
    void showRows()
    {
        runLoop.runPosted();
        deliverNeighbors(1);
        refresh();
    }
    bool screenShowsWindow() const
    {
        const QImage shown = QGuiApplication::primaryScreen()->grabWindow(0, 0, 0, 375, 667).toImage();
        return shown == app->window()->grab().toImage().convertToFormat(shown.format());
    }

    std::shared_ptr<OrvexApp> app = OrvexApp::create(platform(), QSize(375, 667));
    QWidget cover;
};

TEST_F(CoveredWindow, PaintsNothingUntilUncovered)
{
    coverWith({0, 0, 800, 700});
    PaintCounter paints(*app->window());
    QTest::qWait(300);
    showRows();
    QTest::qWait(100);
    EXPECT_EQ(paints.count, 0);
    cover.hide();
    EXPECT_TRUE(QTest::qWaitFor([&] { return paints.count > 0; }));
    EXPECT_EQ(paneAt(*app->navigationStack(), 0).tableList().rowCount(), 2)
        << "the first painting shows the latest rows";
    EXPECT_TRUE(QTest::qWaitFor([&] { return screenShowsWindow(); }));
}

TEST_F(CoveredWindow, IsPaintedWhileAnEdgeShows)
{
    showRows();
    coverWith({0, 0, 374, 700});
    PaintCounter paints(*app->window());
    deliverNeighbors(2);
    refresh();
    EXPECT_TRUE(QTest::qWaitFor([&] { return paints.count > 0; }));
}

} // namespace
} // namespace orvex::test
