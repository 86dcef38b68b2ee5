#include "OrvexSaveViewController.h"

#include "Alert.h"
#include "Bar.h"
#include "OrvexApp.h"
#include "PaneFixture.h"
#include "SaveHistoryContentCell.h"
#include "SessionFixture.h"
#include "Snapshot.h"

#include "RecordingLog.h"
#include "Storage.h"

#include <QLineEdit>

#include <filesystem>

namespace orvex::test {
namespace {

class OrvexSaveViewControllerTest : public testing::Test, public SessionFixture {
protected:
    OrvexSaveViewControllerTest()
    {
        std::filesystem::remove_all(paths::diagnosticReports());
        app->applicationDidFinishLaunching();
        runLoop.runPosted();
        deliverNeighbors(1);
        refresh();
        QApplication::setActiveWindow(app->window());
    }

    OrvexSaveViewController& open()
    {
        app->showSaveView();
        return static_cast<OrvexSaveViewController&>(*app->saveViewController());
    }
    static std::string rowAt(const OrvexSaveViewController& screen, int row)
    {
        const auto* const cell = screen.saveContentTable().cellAtRow(row);
        return static_cast<const SaveHistoryContentCell*>(cell)->text().text().toStdString();
    }
    // Null while there is none: an alert takes the focus.
    static Alert* shownAlert() { return dynamic_cast<Alert*>(QApplication::focusWidget()); }
    // Where a save at this second goes.
    static std::string pathAt(double seconds)
    {
        return snapshotPath(paths::diagnosticReports(), Date{seconds});
    }

    std::shared_ptr<OrvexApp> app = OrvexApp::create(platform());
    RecordingLog log;
};

TEST_F(OrvexSaveViewControllerTest, SavesTheContentsFromWhenItWasOpened)
{
    clock.moment.secondsSince1970 = 1'709'647'629; // 2024-03-05 14:07:09 UTC
    OrvexSaveViewController& screen = open();
    EXPECT_EQ(screen.saveContentTable().cellAtRow(1)->accessory(), TableCell::Accessory::checkmark);
    EXPECT_EQ(rowAt(screen, 0), "Snapshot (2023-11-14 22:13:20 +0000)");
    EXPECT_EQ(rowAt(screen, 1), "DLF binary (201 bytes)");

    QTest::keyClicks(&screen.saveDescription(), "Under the <bridge> & ");
    screen.saveDescription().insert(QStringLiteral("ü"));
    clock.moment.secondsSince1970 += 60;
    deliverNeighbors(2); // too late for the snapshot
    QTest::mouseClick(screen.findChild<QAbstractButton*>(QStringLiteral("saveButton")), Qt::LeftButton);
    EXPECT_EQ(app->saveViewController(), &screen) << "not inside the action of its own button";
    runLoop.runPosted();
    EXPECT_EQ(app->saveViewController(), nullptr);
    EXPECT_EQ(shownAlert(), nullptr);

    const auto [saved, error] = readSnapshot(pathAt(1'709'647'689));
    ASSERT_TRUE(saved) << error;
    EXPECT_EQ(saved->timestamp, "2024-03-05 14:07:09 +0000");
    EXPECT_EQ(saved->description, "Under the <bridge> & ü");
    ASSERT_EQ(saved->data->size(), 2U);
    const Dictionary& entry = *(*saved->data)[0].dictionary();
    EXPECT_EQ((*entry["Display"].dictionary())["Neighbor Cells List"].array()->size(), 1U);
    EXPECT_EQ(entry["DisplayState"].data()->size(), 41U);
    EXPECT_EQ((*(*saved->data)[1].dictionary())["DLF"].data()->size(), 201U);

    namespace fs = std::filesystem; // private: it identifies the subscriber
    EXPECT_EQ(fs::status(paths::diagnosticReports()).permissions(), fs::perms(0700));
    EXPECT_EQ(fs::status(pathAt(1'709'647'689)).permissions(), fs::perms(0600));
}

TEST_F(OrvexSaveViewControllerTest, ReportsThatTheFileCouldNotBeWritten)
{
    OrvexSaveViewController& screen = open();
    std::filesystem::remove_all(paths::diagnosticReports());
    screen.savePressed();
    EXPECT_EQ(log.lines.back(), "<3>Unable to write snapshot to " + pathAt(clock.now().secondsSince1970));
    runLoop.runPosted();
    EXPECT_EQ(app->saveViewController(), nullptr);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);

    Alert* const alert = shownAlert();
    ASSERT_NE(alert, nullptr) << "outlives the screen";
    EXPECT_EQ(alert->title().text(), "File Error");
    EXPECT_EQ(alert->message().text(), "Unable to write file to disk");
    EXPECT_EQ(alert->button().text(), "Close");
    app->window()->resize(500, 300);
    EXPECT_EQ(alert->geometry(), app->window()->rect());
    app->navigationStack()->setFocus();
    EXPECT_EQ(shownAlert(), alert);
    QTest::mouseClick(&alert->button(), Qt::LeftButton);
    EXPECT_FALSE(alert->isVisible());
}

TEST_F(OrvexSaveViewControllerTest, ATouchBesideTheFieldTakesTheFocusFromIt)
{
    OrvexSaveViewController& screen = open();
    EXPECT_TRUE(screen.saveDescription().hasFocus()) << "from the start";
    for (const int y : {600, 110}) { // below all, and the caption
        screen.saveDescription().setFocus();
        QTest::mouseClick(screen.childAt(20, y), Qt::LeftButton);
        EXPECT_FALSE(screen.saveDescription().hasFocus()) << y;
    }
}

TEST_F(OrvexSaveViewControllerTest, CancelAndEscapeSaveNothing)
{
    for (const bool isEscape : {false, true}) {
        OrvexSaveViewController& screen = open();
        if (isEscape)
            QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
        else
            QTest::mouseClick(screen.findChild<QWidget*>("cancelButton"), Qt::LeftButton);
        runLoop.runPosted();
        EXPECT_EQ(app->saveViewController(), nullptr);
        EXPECT_TRUE(std::filesystem::is_empty(paths::diagnosticReports()));
    }
}

TEST_F(OrvexSaveViewControllerTest, SavesNothingWithoutAPlaceForIt)
{
    OrvexSaveViewController(nullptr, clock, "", [] {}).savePressed();
    EXPECT_EQ(log.lines.back(), "<3>Unable to write snapshot to " + snapshotPath("", clock.now()));
    EXPECT_FALSE(std::filesystem::exists(snapshotPath("", clock.now())));
}

} // namespace
} // namespace orvex::test
