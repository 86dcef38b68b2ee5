#include "ConsoleProgram.h"

#include "ConsoleColours.h"
#include "ConsoleOutput.h"
#include "Diagnosis.h"
#include "JsonView.h"
#include "LineView.h"
#include "LinuxPlatform.h"
#include "OpenedFile.h"
#include "OrvexConsole.h"
#include "TerminalView.h"

#include "FileConflict.h"
#include "NodesByPath.h"
#include "Process.h"
#include "RawTerminal.h"
#include "SystemLog.h"

#include <QCoreApplication>
#include <QTimer>

#include <cerrno>
#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <unistd.h>

namespace orvex {

namespace {

constexpr int kExitFailure = 1;

// Lines for standard output go to standard error: the tree has the former for itself. A terminal redrawn in
// place has no room for them at all.
void installConsoleBesideTree()
{
    const bool wouldDisturb = ::isatty(STDOUT_FILENO) && ::isatty(STDERR_FILENO);
    installConsole([wouldDisturb](std::string_view line) {
        if (!wouldDisturb)
            std::fprintf(stderr, "%.*s\n", static_cast<int>(line.size()), line.data());
    });
}

// Standard output of a program that ends when nobody reads it.
class ConsoleStream {
public:
    int status() const { return _status; }
    StandardOutput& output() { return _output; }

private:
    void closed(int error)
    {
        if (error != EPIPE) {
            printError(
                std::string("standard output: ") + std::strerror(error)); // NOLINT(concurrency-mt-unsafe)
            _status = kExitFailure;
        }
        installConsole([](std::string_view) {});        // nobody reads them any more
        QTimer::singleShot(0, &QCoreApplication::quit); // the event loop may not run yet
    }

    int _status = EXIT_SUCCESS;
    StandardOutput _output{[this](int error) { closed(error); }};
};

// A terminal's screen with its keyboard.
class Terminal {
public:
    explicit Terminal(ConsoleOutput& output)
        : _view(output,
            {.usesColour = standardOutputTakesColours(), .hasKeyboard = [this] { return _raw.readsKeys(); }})
    {
    }

    ~Terminal() { _view.leave(); }
    Terminal(const Terminal&) = delete;
    Terminal& operator=(const Terminal&) = delete;

    ConsoleView& view() { return _view; }

private:
    void takeInput(std::string_view bytes)
    {
        for (const TerminalKey& key : terminalKeysIn(bytes)) {
            if (!_view.press(key))
                return QCoreApplication::quit();
        }
    }

    TerminalView _view;
    RawTerminal _raw{{.onInput = [this](std::string_view bytes) { takeInput(bytes); },
        .onRedraw = [this] { _view.redraw(); }}};
};

// Returns why the files cannot be used together; empty when they can.
std::string conflictOf(const ConsoleOptions& options)
{
    std::vector<FileInUse> outputs;
    if (options.timelineFile)
        outputs.push_back({"--timeline " + *options.timelineFile, *options.timelineFile});
    if (options.saveFile)
        outputs.push_back({"--save " + *options.saveFile, *options.saveFile});
    return fileConflict({}, outputs);
}

std::unique_ptr<ConsoleView> pageView(ConsoleOutput& output, const ConsoleOptions& options)
{
    if (options.json)
        return std::make_unique<JsonView>(output);
    return std::make_unique<LineView>(output, standardOutputTakesColours());
}

} // namespace

void keepDecimalPoints()
{
    std::setlocale(LC_NUMERIC, "C");
}

int runConsole(int argc, char** argv, const AppOptions& options)
{
    const QCoreApplication application(argc, argv);
    keepDecimalPoints();
    if (const std::string conflict = conflictOf(options.console); !conflict.empty()) {
        printError(conflict);
        return CommandLine::kWrongUsage;
    }
    LinuxPlatform platform(options.resourceDirectory());
    ConsoleStream stream;
    const bool redrawsTerminal = ::isatty(STDOUT_FILENO) && !options.console.once && !options.console.json;
    installConsoleBesideTree();
    const TerminationSignals terminationSignals([] { QCoreApplication::quit(); });
    std::optional<Terminal> terminal;
    std::unique_ptr<ConsoleView> pages;
    if (redrawsTerminal)
        terminal.emplace(stream.output());
    else
        pages = pageView(stream.output(), options.console);
    OrvexConsole console(platform.forApp(), terminal ? terminal->view() : *pages, options.console);
    console.start([] { QCoreApplication::quit(); });
    QCoreApplication::exec();
    console.applicationWillTerminate();
    terminal.reset(); // an error's line comes below the last frame
    if (!console.failure().empty()) {
        printError(console.failure());
        return kExitFailure;
    }
    return stream.status();
}

int printFile(int argc, char** argv, const AppOptions& options)
{
    const QCoreApplication application(argc, argv);
    keepDecimalPoints();
    installConsoleBesideTree();
    LinuxPlatform platform(options.resourceDirectory());
    const OpenedFile opened = openFile(*options.file, platform.forFiles());
    if (!opened.tree) {
        printError(opened.error);
        return kExitFailure;
    }
    const std::string& path = options.console.path;
    const OrvexModelNodeRef tree = NodesByPath(opened.tree)[path];
    if (!tree) {
        printError(*options.file + ": nothing at " + path);
        return kExitFailure;
    }
    ConsoleStream stream;
    pageView(stream.output(), options.console)
        ->show({.status = opened.status, .isConnected = true, .path = path, .tree = tree});
    return stream.status();
}

int printDiagnosis(int argc, char** argv, const AppOptions& options)
{
    const QCoreApplication application(argc, argv);
    keepDecimalPoints();
    installConsole([](std::string_view) {}); // says nothing of faults
    LinuxPlatform platform(options.resourceDirectory());
    const PortDirectory directory;
    const auto findings = Diagnosis(platform.forApp().session, directory).run();
    for (const auto& [isFault, text] : findings)
        std::printf("%-5s %s\n", isFault ? "fault" : "ok", text.c_str());
    const bool isWritten = std::fflush(stdout) == 0;
    return isWritten && !Diagnosis::failed(findings) ? EXIT_SUCCESS : kExitFailure;
}

} // namespace orvex
