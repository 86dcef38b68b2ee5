// orvex: shows what the handset's baseband reports, in a window or on the terminal.

#include "AppOptions.h"
#include "ConsoleOutput.h"
#include "OrvexApp.h"
#include "OrvexConsole.h"
#include "SnapshotViewer.h"
#include "Window.h"

#include "DisplayTreePrinter.h"
#include "SnapshotTree.h"

#include "FileStorage.h"
#include "KoratTelephonyService.h"
#include "LinuxSystemLog.h"
#include "Process.h"
#include "QtRunLoop.h"
#include "SocketMessagePorts.h"

#include "SystemLog.h"
#include "VisibleText.h"

#include <QApplication>
#include <QScreen>
#include <QTimer>

#include <algorithm>
#include <cerrno>
#include <clocale>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <functional>
#include <optional>
#include <unistd.h>

namespace {

using namespace orvex;

constexpr int kExitFailure = 1;

void printError(const std::string& why)
{
    std::fprintf(stderr, "orvex: %s\n", visibleText(why).c_str());
}

// The implementations of the platform, in the order of their dependencies.
struct LinuxPlatform {
    explicit LinuxPlatform(const std::string& resourceDirectory)
        : resources(resourceDirectory)
    {
    }

    AppPlatform forApp()
    {
        return {.session = {.runLoop = runLoop,
                    .ports = ports,
                    .telephony = telephony,
                    .generators = {.resources = resources, .clock = clock, .buildVersion = ORVEX_VERSION},
                    .printError = printError},
            .preferences = preferences};
    }

    QtRunLoop runLoop;
    SocketMessagePorts ports;
    KoratTelephonyService telephony{ports};
    FileResources resources;
    SystemClock clock;
    IniPreferences preferences;
};

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

// Qt sets the user's locale, which may have decimal commas. Values and property lists have points.
void keepDecimalPoints()
{
    std::setlocale(LC_NUMERIC, "C");
}

// For programs whose standard output is read by other programs.
void writeConsoleToStandardError(std::string_view line)
{
    std::fprintf(stderr, "%.*s\n", static_cast<int>(line.size()), line.data());
}

int runConsole(int argc, char** argv, const std::string& resourceDirectory)
{
    const QCoreApplication application(argc, argv);
    keepDecimalPoints();
    // Standard output is for the tree alone, and a terminal redrawn in place has no room for other lines.
    const bool wouldDisturb = ::isatty(STDOUT_FILENO) && ::isatty(STDERR_FILENO);
    installConsole([wouldDisturb](std::string_view line) {
        if (!wouldDisturb)
            writeConsoleToStandardError(line);
    });
    LinuxPlatform platform(resourceDirectory);
    int status = EXIT_SUCCESS;
    StandardOutput output([&status](int error) {
        if (error != EPIPE) {
            printError(
                std::string("standard output: ") + std::strerror(error)); // NOLINT(concurrency-mt-unsafe)
            status = kExitFailure;
        }
        installConsole([](std::string_view) {});        // nobody reads them any more
        QTimer::singleShot(0, &QCoreApplication::quit); // the event loop may not run yet
    });
    OrvexConsole console(platform.forApp(), output);
    const TerminationSignals terminationSignals([] { QCoreApplication::quit(); });
    console.start();
    QCoreApplication::exec();
    console.applicationWillTerminate();
    return status;
}

std::optional<QSize> windowSize(const AppOptions& options)
{
    return options.windowSizeOn(QGuiApplication::primaryScreen()->size());
}

// Runs the body with an application object that can open windows.
int runInWindow(int argc, char** argv, Theme::Mode theme, const std::function<int()>& body)
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
    Theme::use(theme);
    installAccessibility();
    return body();
}

int runWindow(int argc, char** argv, const std::string& resourceDirectory, const AppOptions& options)
{
    return runInWindow(argc, argv, options.theme, [&resourceDirectory, &options] {
        LinuxPlatform platform(resourceDirectory);
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

// Shows the tree of the file, on the terminal or in a window.
int showSnapshot(int argc, char** argv, const AppOptions& options)
{
    const std::string& path = *options.snapshot;
    const auto [snapshot, error] = readSnapshot(path);
    if (!snapshot) {
        printError(error);
        return kExitFailure;
    }
    if (options.usesConsole) {
        const std::string tree = DisplayTreePrinter::text(*snapshotTree(*snapshot));
        const bool written = std::printf("%s\n%s", snapshotMessage(*snapshot).c_str(), tree.c_str()) >= 0
            && std::fflush(stdout) == 0;
        return written ? EXIT_SUCCESS : kExitFailure;
    }
    return runInWindow(argc, argv, options.theme, [&, &shown = *snapshot] {
        const SnapshotViewer viewer(
            shown, std::filesystem::path(path).filename().string(), windowSize(options));
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
    const std::string directory = options.resources.value_or(FileResources::defaultDirectory());
    const auto run = [&] {
        if (options.snapshot)
            return showSnapshot(argc, argv, options);
        return options.usesConsole ? runConsole(argc, argv, directory)
                                   : runWindow(argc, argv, directory, options);
    };
    const int status = run();
    SystemLog::install(nullptr);
    log->flush();
    return status;
}
