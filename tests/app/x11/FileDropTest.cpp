// Files dragged with the mouse from this program to the window of a real monitor.

#include "Captures.h"

#include <QDrag>
#include <QMimeData>
#include <QMouseEvent>
#include <QProcess>
#include <QScreen>
#include <QTemporaryDir>
#include <QTest>
#include <QUrl>
#include <QWidget>

#include <gtest/gtest.h>

#include <filesystem>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <utility>

namespace orvex::test {
namespace {

namespace fs = std::filesystem;

constexpr int kPatience = 10'000; // ms

// A window at the right edge of the screen whose content is a file.
class Source final : public QWidget {
public:
    QString file;

    Source() { setGeometry(600, 0, 100, 100); }
    void mousePressEvent(QMouseEvent*) override
    {
        auto* const drag = new QDrag(this);
        auto* const content = new QMimeData;
        content->setUrls({QUrl::fromLocalFile(file)});
        drag->setMimeData(content);
        drag->exec();
    }
};

QByteArray xdotool(const QStringList& arguments)
{
    QProcess tool;
    tool.start("xdotool", arguments);
    EXPECT_TRUE(QTest::qWaitFor([&] { return tool.state() == QProcess::NotRunning; }, kPatience));
    return tool.readAllStandardOutput().trimmed();
}

struct FileDrop : testing::Test {
    FileDrop()
    {
        fs::create_directory(name("a program"));
        fs::copy_file(ORVEX_PATH, name("a program/orvex"));
        fs::copy_file(capturePath("MRL_LTE"), name("a capture.pcap"));
        source.show();
        EXPECT_TRUE(QTest::qWaitForWindowExposed(&source));
    }
    std::string name(const char* file) const { return folder.filePath(file).toStdString(); }
    // Starts a program of its own, without templates beside it.
    void start(QProcess& program, const QStringList& arguments) const
    {
        auto environment = QProcessEnvironment::systemEnvironment();
        environment.insert("ORVEX_PORT_DIR", folder.filePath("ports"));
        program.setProcessEnvironment(environment);
        program.start(folder.filePath("a program/orvex"),
            QStringList{"--dark", "--size", "375x667", "--resources", ORVEX_RESOURCES} + arguments);
    }
    // Lets go of the file over the window at the screen's origin. In one call, since the drag has an event
    // loop of its own.
    void drop(const char* file)
    {
        source.file = folder.filePath(file);
        QStringList steps{"mousemove", "650", "50", "mousedown", "1"};
        for (const char* y : {"60", "300", "305", "305"})
            steps += {"sleep", "0.1", "mousemove", "200", y};
        xdotool(steps + QStringList{"mouseup", "1"});
    }
    // The window with that file's name in its title, once it is on the screen.
    static WId windowOf(const char* file)
    {
        return xdotool({"search", "--sync", "--onlyvisible", "--name", QString(file) + " – Orvex"})
            .toULongLong();
    }
    // What the window shows once it is painted and no longer changes.
    static QImage settledPicture(WId window)
    {
        QImage former;
        QImage now;
        const auto isSettled = [&] {
            former = std::exchange(now, QGuiApplication::primaryScreen()->grabWindow(window).toImage());
            QImage blank = now;
            blank.fill(now.pixel(0, 0));
            QTest::qWait(200);
            return now == former && now != blank;
        };
        EXPECT_TRUE(QTest::qWaitFor(isSettled, kPatience));
        return now;
    }

    QTemporaryDir folder;
    Source source;
};

TEST_F(FileDrop, OpensAnotherWindowThatLooksTheSame)
{
    const struct {
        const char* file;
        const char* endingKey;
        int status;
    } cases[] = {{"a capture.pcap", "ctrl+q", 0}, {"nothing", "Return", 1}};
    ASSERT_EQ(::prctl(PR_SET_CHILD_SUBREAPER, 1), 0); // processes without a parent become this one's
    for (const auto& [file, endingKey, status] : cases) {
        QProcess direct;
        start(direct, {"--alert", folder.filePath(file)});
        const QImage expected = settledPicture(windowOf(file));
        direct.kill();
        direct.waitForFinished();

        QProcess monitor;
        start(monitor, {});
        xdotool({"search", "--sync", "--onlyvisible", "--name", "^Orvex$"});
        drop(file);
        const WId opened = windowOf(file);
        EXPECT_TRUE(settledPicture(opened) == expected) << file;
        const QString window = QString::number(opened);
        const pid_t process = xdotool({"getwindowpid", window}).toInt();
        xdotool({"windowfocus", window, "key", endingKey});
        int ending = -1;
        EXPECT_TRUE(QTest::qWaitFor([&] { return ::waitpid(process, &ending, WNOHANG) == process; })) << file;
        EXPECT_EQ(WEXITSTATUS(ending), status) << file;
        EXPECT_EQ(monitor.state(), QProcess::Running);
        monitor.kill();
        monitor.waitForFinished();
    }
}

} // namespace
} // namespace orvex::test
