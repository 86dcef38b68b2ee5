#include "OrvexSaveViewController.h"

#include "Alert.h"
#include "BarButton.h"
#include "OrvexApp.h"
#include "PaneFixture.h"
#include "SaveHistoryContentCell.h"
#include "SessionFixture.h"
#include "Snapshot.h"

#include "FixedPaths.h"
#include "RecordingLog.h"

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
    }

    OrvexSaveViewController& open()
    {
        app->showSaveView();
        return static_cast<OrvexSaveViewController&>(*app->saveViewController());
    }
    static std::string rowAt(const OrvexSaveViewController& screen, int row)
    {
        const auto* const cell =
            static_cast<SaveHistoryContentCell*>(screen.saveContentTable().cellAtRow(row));
        const bool isTicked = cell->accessory() == TableCell::Accessory::checkmark;
        return (isTicked ? "[x] " : "[ ] ") + cell->text().text().toStdString();
    }
    // Null while there is none.
    Alert* shownAlert() const
    {
        for (QObject* child : app->window()->children()) {
            auto* const alert = dynamic_cast<Alert*>(child);
            if (alert && alert->isVisible())
                return alert;
        }
        return nullptr;
    }
    // Where a save at this second goes.
    static std::string pathAt(double seconds)
    {
        return snapshotPath(paths::diagnosticReports(), Date{seconds});
    }

    std::shared_ptr<OrvexApp> app = OrvexApp::create(platform());
    RecordingLog log;
};

TEST_F(OrvexSaveViewControllerTest, SavesWhatThereWasWhenItWasOpened)
{
    clock.moment.secondsSince1970 = 1'709'647'629; // 2024-03-05 14:07:09 UTC
    OrvexSaveViewController& screen = open();
    ASSERT_EQ(screen.saveContentTable().rowCount(), 2);
    EXPECT_EQ(rowAt(screen, 0), "[x] Snapshot (2023-11-14 22:13:20 +0000)");
    EXPECT_EQ(rowAt(screen, 1), "[x] DLF binary (201 bytes)");

    QTest::keyClicks(&screen.saveDescription(), "Under the <bridge> & ");
    screen.saveDescription().insert(QStringLiteral("ü"));
    clock.moment.secondsSince1970 += 60.5;
    deliverNeighbors(2); // not in the snapshot any more
    screen.savePressed();
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
}

TEST_F(OrvexSaveViewControllerTest, SavesEmptyWordsAndCancelSavesNothing)
{
    OrvexSaveViewController& first = open();
    first.cancelPressed();
    runLoop.runPosted();
    EXPECT_EQ(app->saveViewController(), nullptr);
    EXPECT_TRUE(std::filesystem::is_empty(paths::diagnosticReports()));

    open().savePressed();
    runLoop.runPosted();
    const auto [saved, error] = readSnapshot(pathAt(clock.now().secondsSince1970));
    ASSERT_TRUE(saved) << error;
    EXPECT_EQ(saved->description, "");
}

TEST_F(OrvexSaveViewControllerTest, SaysThatTheFileCouldNotBeWrittenAndTheSessionGoesOn)
{
    OrvexSaveViewController& screen = open();
    std::filesystem::remove_all(paths::diagnosticReports());
    log.take();
    screen.savePressed();
    EXPECT_EQ(log.take(),
        std::vector<std::string>{"<3>Unable to write snapshot to " + pathAt(clock.now().secondsSince1970)});
    runLoop.runPosted();
    EXPECT_EQ(app->saveViewController(), nullptr);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);

    Alert* const alert = shownAlert();
    ASSERT_NE(alert, nullptr) << "stays when the screen goes";
    EXPECT_EQ(alert->title().text(), "File Error");
    EXPECT_EQ(alert->message().text(), "Unable to write file to disk");
    EXPECT_EQ(alert->button().text(), "Close");
    app->window()->resize(500, 300);
    EXPECT_EQ(alert->geometry(), app->window()->rect());
    deliverNeighbors(3);
    refresh();
    EXPECT_EQ(shownAlert(), alert);
    QApplication::setActiveWindow(app->window());
    app->navigationStack()->setFocus();
    EXPECT_EQ(QApplication::focusWidget(), alert) << "keys are the alert's";
    QTest::mouseClick(&alert->button(), Qt::LeftButton);
    EXPECT_EQ(shownAlert(), nullptr);
    EXPECT_NE(QApplication::focusWidget(), alert);
}

TEST_F(OrvexSaveViewControllerTest, ATouchBesideTheFieldTakesTheKeyboardAway)
{
    OrvexSaveViewController& screen = open();
    QLineEdit& field = screen.saveDescription();
    QApplication::setActiveWindow(app->window());
    const auto focus = [&field] {
        field.setFocus();
        ASSERT_TRUE(field.hasFocus());
    };
    focus();
    tapRow(screen.saveContentTable(), 0);
    EXPECT_FALSE(field.hasFocus());
    EXPECT_EQ(screen.saveContentTable().selectedRow(), std::nullopt);
    focus();
    QTest::mouseClick(&screen, Qt::LeftButton, {}, QPoint(100, 600));
    EXPECT_FALSE(field.hasFocus());
    focus();
    QTest::keyClick(&field, Qt::Key_Return);
    EXPECT_FALSE(field.hasFocus());
}

TEST(OrvexSaveViewController, WithoutContentsSavesAnEmptyList)
{
    const FixedClock clock;
    bool isClosed = false;
    OrvexSaveViewController screen(nullptr, clock, QDir::tempPath().toStdString(), [&] { isClosed = true; });
    EXPECT_EQ(screen.saveContentTable().rowCount(), 0);
    screen.savePressed();
    EXPECT_TRUE(isClosed);
    const std::string path = snapshotPath(QDir::tempPath().toStdString(), clock.now());
    const auto [saved, error] = readSnapshot(path);
    std::filesystem::remove(path);
    ASSERT_TRUE(saved) << error;
    EXPECT_TRUE(saved->data->isEmpty());
}

} // namespace
} // namespace orvex::test
