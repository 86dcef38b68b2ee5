// Runs the tests on a virtual display of their own: what only a window system can say or do.

#include "Animation.h"
#include "Theme.h"

#include <QApplication>
#include <QProcess>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <memory>

namespace {

class VirtualDisplay final : public testing::Environment {
public:
    void SetUp() override
    {
        _server.start("Xvfb", {"-displayfd", "1", "-screen", "0", "800x700x24", "-nolisten", "tcp"});
        QByteArray display;
        while (!display.endsWith('\n') && _server.waitForReadyRead())
            display += _server.readAllStandardOutput();
        ASSERT_FALSE(display.isEmpty()) << "Xvfb does not start";
        qputenv("DISPLAY", ':' + display.trimmed());
        qputenv("QT_QPA_PLATFORM", "xcb");
        qputenv("ORVEX_ROOT", _root.path().toUtf8());
        static int argc = 1;
        static char name[] = "x11_tests";
        static char* argv[] = {name, nullptr};
        _application = std::make_unique<QApplication>(argc, argv);
        orvex::Theme::use(orvex::Theme::Mode::light);
        orvex::setAnimationsEnabled(false);
    }
    void TearDown() override
    {
        _application.reset();
        _server.terminate();
        _server.waitForFinished();
    }

private:
    QProcess _server;
    QTemporaryDir _root;
    std::unique_ptr<QApplication> _application;
};

} // namespace

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    testing::AddGlobalTestEnvironment(new VirtualDisplay);
    return RUN_ALL_TESTS();
}
