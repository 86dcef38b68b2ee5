#include "AppOptions.h"

#include "FileStorage.h"

#include <QRegularExpression>

#include <algorithm>
#include <charconv>
#include <cmath>

namespace orvex {

namespace {

constexpr QSize kHandsetSize{375, 667};
constexpr int kBroadestHandset = 600; // the shorter side of its screen

// These say how a session is to run.
constexpr const char* kSessionOptions[] = {
    "print-status", "until-painted", "once", "timeout", "save", "timeline", "diagnose"};

CommandLine::Program program()
{
    return {
        .name = "orvex",
        .summary = "Shows what the handset's baseband reports.",
        .options =
            {
                {"console", "Write to the terminal instead of opening a window."},
                {"once", "Write the first tree that the session shows, then exit."},
                {"path", "Show only the branch at this path, such as '/Serving Cell Measurements'.", "PATH"},
                {"json", "Write a JSON object a line at every refresh."},
                {"timeout",
                    "Exit after S seconds. The status is 0 if a session came up (with --once: if there was a "
                    "tree), else 1.",
                    "S"},
                {"save", "Write a snapshot to this file at the end.", "FILE"},
                {"timeline",
                    "Write to FILE.csv which rows changed when: time, path, key, text, number and unit. Each "
                    "line is written at once, so what was recorded stays if the program is killed.",
                    "FILE.csv"},
                {"every",
                    "With --timeline: look at the display every SECONDS, at least 0.1, if a message came. "
                    "Default: 2.",
                    "SECONDS"},
                {"field",
                    "With --timeline: follow only this row or branch; '*' stands for one component: "
                    "'/Neighbor Cells List/*/Measured RSRP'. May be given more than once.",
                    "PATH", true},
                {"diagnose",
                    "Say why a session does not come up, step by step. The status is 0 if nothing is wrong, "
                    "else 1."},
                {"open", "The same as FILE.", "FILE"},
                {"print-status",
                    "Print the number of messages decoded so far and the status line whenever the line "
                    "changes."},
                {"resources", "Take the section templates from DIR.", "DIR"},
                {"light", "Use light colours. Default: the desktop's."},
                {"dark", "Use dark colours."},
                {"size",
                    "Open the window at this size instead of filling the screen. 'handset' is 375x667, or "
                    "the whole screen on a handset.",
                    "WIDTHxHEIGHT"},
                {"until-painted", "Print 'painted' after the first frame, then exit."},
            },
        .exclusions =
            {
                {"light", "dark"},
                {"console", "light"},
                {"console", "dark"},
                {"console", "print-status"},
                {"console", "until-painted"},
                {"console", "size"},
                {"open", "print-status"},
                {"open", "until-painted"},
                {"open", "once"},
                {"open", "timeout"},
                {"open", "save"},
                {"open", "timeline"},
                {"diagnose", "console"},
                {"diagnose", "open"},
                {"diagnose", "light"},
                {"diagnose", "dark"},
                {"diagnose", "print-status"},
                {"diagnose", "size"},
                {"diagnose", "until-painted"},
            },
        .dependencies =
            {
                {"once", "console"},
                {"path", "console"},
                {"json", "console"},
                {"timeout", "console"},
                {"save", "console"},
                {"timeline", "console"},
                {"every", "timeline"},
                {"field", "timeline"},
            },
        .argumentsSyntax = "[FILE]",
        .argumentsDescription = "Snapshot or capture to show instead of a session.",
    };
}

// "375x667"; absent for anything else.
std::optional<QSize> sizeIn(const std::string& text)
{
    static const QRegularExpression pattern(QStringLiteral("^([1-9][0-9]{0,3})x([1-9][0-9]{0,3})\\z"));
    const QRegularExpressionMatch match = pattern.match(QString::fromStdString(text));
    if (!match.hasMatch())
        return std::nullopt;
    return QSize(match.captured(1).toInt(), match.captured(2).toInt());
}

// The file to show, by --open or as an argument. Returns what is wrong; empty if nothing is.
std::string read(const CommandLine& line, std::optional<std::string>& file)
{
    const std::vector<std::string> arguments = line.arguments();
    file = line.value("open");
    if (arguments.empty())
        return {};
    if (file || arguments.size() > 1)
        return "Unexpected argument '" + arguments[file ? 0 : 1] + "'.";
    for (const char* option : kSessionOptions) {
        if (line.isSet(option))
            return std::string("--") + option + " cannot be combined with a file.";
    }
    file = arguments[0];
    return {};
}

// Absent unless it is a positive number of seconds; up to about 30 years.
std::optional<std::chrono::milliseconds> secondsIn(const std::string& text)
{
    constexpr double kLongest = 1e9;
    double seconds = 0;
    const char* const end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, seconds);
    if (error != std::errc() || stop != end || !(seconds > 0) || seconds > kLongest)
        return std::nullopt;
    return std::chrono::milliseconds(std::llround(std::ceil(seconds * 1000)));
}

// Returns what is wrong; empty if nothing is.
std::string read(const CommandLine& line, ConsoleOptions& options)
{
    options.once = line.isSet("once");
    options.json = line.isSet("json");
    options.saveFile = line.value("save");
    options.timelineFile = line.value("timeline");
    if (options.timelineFile == "-")
        return "--timeline takes a file; the tree goes to standard output.";
    if (const auto path = line.value("path")) {
        if (!path->starts_with('/'))
            return "--path takes a path that begins with '/'.";
        options.path = path->substr(0, std::max<std::size_t>(path->find_last_not_of('/') + 1, 1));
    }
    if (const auto timeout = line.value("timeout")) {
        options.timeout = secondsIn(*timeout);
        if (!options.timeout)
            return "--timeout takes a number of seconds above 0.";
    }
    return options.sampling.read(line.value("every"), line.values("field"));
}

} // namespace

AppOptions AppOptions::parse(int count, const char* const* arguments)
{
    AppOptions result;
    CommandLine line(program());
    result.earlyExit = line.parse(count, arguments);
    if (result.earlyExit)
        return result;
    if (const auto size = line.value("size")) {
        result.fillsHandset = *size == "handset";
        result.size = result.fillsHandset ? kHandsetSize : sizeIn(*size);
        if (!result.size)
            result.earlyExit = line.wrongUsage("--size takes WIDTHxHEIGHT, such as 375x667, or 'handset'.");
    }
    if (const std::string error = read(line, result.console); !error.empty())
        result.earlyExit = line.wrongUsage(error);
    result.diagnoses = line.isSet("diagnose");
    result.usesConsole = line.isSet("console");
    result.printsStatus = line.isSet("print-status");
    result.endsWhenPainted = line.isSet("until-painted");
    if (line.isSet("light"))
        result.theme = Theme::Mode::light;
    if (line.isSet("dark"))
        result.theme = Theme::Mode::dark;
    result.resources = line.value("resources");
    if (const std::string error = read(line, result.file); !error.empty())
        result.earlyExit = line.wrongUsage(error);
    return result;
}

std::string AppOptions::resourceDirectory() const
{
    return resources.value_or(FileResources::defaultDirectory());
}

std::optional<QSize> AppOptions::windowSizeOn(const QSize& screen) const
{
    if (fillsHandset && std::min(screen.width(), screen.height()) <= kBroadestHandset)
        return std::nullopt;
    return size;
}

} // namespace orvex
