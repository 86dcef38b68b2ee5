// orvex: shows what the handset's baseband reports, in a window or on the terminal.

#include "AppOptions.h"
#include "ConsoleOutput.h"
#include "ConsoleProgram.h"
#include "LinuxPlatform.h"
#include "OpenedFile.h"
#include "OrvexApp.h"
#include "SnapshotViewer.h"
#include "Window.h"

#include "LinuxSystemLog.h"
#include "Process.h"
#include "SystemLog.h"

#include <QApplication>
#include <QByteArray>
#include <QScreen>

#include <algorithm>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <functional>
#include <optional>

namespace {

using namespace orvex;

constexpr int kExitFailure = 1;

void printNoDisplay()
{
    printError("There is no display to connect to. Try 'orvex --console'.");
}

bool displayIsNamed()
{
    constexpr const char* kNames[] = {"DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM"};
    return std::ranges::any_of(kNames, [](const char* name) {
        const char* const value = std::getenv(name);
        return value && *value != '\0';
    });
}

// While the application object is constructed, Qt's only fatal message is that it cannot open a display; Qt
// would then abort. The warnings before it say the same at length.
void endWithoutDisplay(QtMsgType type, const QMessageLogContext&, const QString&)
{
    if (type != QtFatalMsg)
        return;
    printNoDisplay();
    std::_Exit(kExitFailure);
}

// For programs whose standard output is read by other programs.
void writeConsoleToStandardError(std::string_view line)
{
    std::fprintf(stderr, "%.*s\n", static_cast<int>(line.size()), line.data());
}

std::optional<QSize> windowSize(const AppOptions& options)
{
    return options.windowSizeOn(QGuiApplication::primaryScreen()->size());
}

// Runs the body with an application object that can open windows.
int runInWindow(int argc, char** argv, const AppOptions& options, const std::function<int()>& body)
{
    if (!displayIsNamed()) {
        printNoDisplay();
        return kExitFailure;
    }
    const QtMessageHandler usualHandler = qInstallMessageHandler(endWithoutDisplay);
    const QApplication application(argc, argv);
    keepDecimalPoints();
    qInstallMessageHandler(usualHandler);
    QApplication::setApplicationName(QStringLiteral("orvex"));
    Theme::use(options.theme);
    installAccessibility();
    if (options.resources) // the windows of dropped files take the same
        qputenv("ORVEX_RESOURCES", QByteArray::fromStdString(*options.resources));
    return body();
}

int runWindow(int argc, char** argv, const AppOptions& options)
{
    return runInWindow(argc, argv, options, [&options] {
        LinuxPlatform platform(options.resourceDirectory());
        const auto app = OrvexApp::create(platform.forApp(), windowSize(options));
        std::optional<StandardOutput> output;
        std::optional<StatusPrinter> statusPrinter;
        if (options.printsStatus) {
            installConsole(writeConsoleToStandardError);
            output.emplace([](int) {}); // the window stays even if nobody reads
            statusPrinter.emplace(*app, *output);
        }
        const TerminationSignals terminationSignals([] { QCoreApplication::quit(); });
        std::optional<FirstPaint> firstPaint;
        if (options.endsWhenPainted) {
            firstPaint.emplace([] {
                std::puts("painted");
                std::fflush(stdout);
                QCoreApplication::quit();
            });
        }
        app->applicationDidFinishLaunching();
        const int status = QApplication::exec();
        app->applicationWillTerminate();
        return status;
    });
}

// Shows the tree of the file that the options name.
int showFile(int argc, char** argv, const AppOptions& options)
{
    return runInWindow(argc, argv, options, [&options] {
        LinuxPlatform platform(options.resourceDirectory());
        const OpenedFile opened = openFile(*options.file, platform.forFiles());
        const std::string name = std::filesystem::path(*options.file).filename().string();
        if (!opened.tree) {
            printError(opened.error);
            if (options.alerts)
                alertOfFileError(name, opened.error);
            return kExitFailure;
        }
        const SnapshotViewer viewer(opened.tree, opened.status, name, windowSize(options));
        const TerminationSignals terminationSignals([] { QCoreApplication::quit(); });
        return QApplication::exec();
    });
}

} // namespace

int main(int argc, char** argv)
{
    occupyStandardStreams();
    const auto options = AppOptions::parse(argc, argv);
    if (options.earlyExit)
        return options.earlyExit->print();

    std::signal(SIGPIPE, SIG_IGN); // the failing write reports a reader that has gone
    const auto log = makeLinuxSystemLog("orvex");
    SystemLog::install(log.get());
    installFatalErrorHandler();
    const auto run = [&] {
        if (options.diagnoses)
            return printDiagnosis(argc, argv, options);
        if (options.usesConsole)
            return options.file ? printFile(argc, argv, options) : runConsole(argc, argv, options);
        return options.file ? showFile(argc, argv, options) : runWindow(argc, argv, options);
    };
    const int status = run();
    SystemLog::install(nullptr);
    log->flush();
    return status;
}
