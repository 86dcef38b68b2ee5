#include "DecodeOptions.h"

#include "RegularFile.h"
#include "TelephonyConstants.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace orvex {

namespace {

// What shows captures over time, instead of printing a document.
constexpr const char* kSampled[] = {"timeline", "report"};

CommandLine::Program baseProgram()
{
    return {
        .name = "orvex-decode",
        .summary = "Decodes the log messages of captures and prints the display tree. Captures of one "
                   "technology make one session, in order. Of snapshots it prints what they store and, with "
                   "--technology, what their raw messages decode to now.\n\n"
                   "'-' is standard input or standard output. No output may be one of the inputs or another "
                   "output.",
        .options =
            {
                {"technology",
                    "Technology of the messages: IFX, MRL_GSM, MRL_CDMA, MRL_LTE or MRL_UTRAN2. Default: "
                    "guessed from the log codes of each capture.",
                    "T"},
                {"format",
                    "Print the tree as text or as JSON. JSON gives the path of each node, except in trees of "
                    "32 levels or more, which go on one line without paths. Default: tree.",
                    "tree|json"},
                {"path", "Print only this branch or row of the display: '/Serving Cell Info'.", "PATH"},
                {"summary",
                    "Instead of decoding, print a table of the log codes in each capture: packets, bytes, "
                    "how many are decoded, times."},
                {"diff",
                    "Print the rows in which the last displays of two snapshots differ. Exit status: 0 for "
                    "none, 1 for some, 2 for trouble."},
                {"refresh-every",
                    "Also ask for the display after every N messages, as a session does every two seconds. "
                    "Default: only at the end.",
                    "N"},
                {"timeline",
                    "Instead of the tree, write to FILE which rows changed when, by the clock of the "
                    "capture: time, path, key, text, number and unit. FILE becomes a CSV table of one "
                    "capture. If it is named .sqlite, captures are added to that database, each once, "
                    "however often.",
                    "FILE"},
                {"report",
                    "Instead of the tree, write to FILE.html a page that any browser opens: plots of the "
                    "levels over time, serving cells, neighbours, contexts, log codes and the last display.",
                    "FILE.html"},
                {"every",
                    "With --timeline or --report: look at the display every SECONDS, at least 0.1. Default: "
                    "2.",
                    "SECONDS"},
                {"field",
                    "With --timeline or --report: follow only this row or branch; '*' stands for one "
                    "component: "
                    "'/Neighbor Cells List/*/Measured RSRP'. May be given more than once.",
                    "PATH", true},
                {"output", "Print to FILE.", "FILE"},
                {"quiet",
                    "On standard error, print errors only: no notes, no progress. With --diff, print no "
                    "differences."},
                {"log", "Write every line of the system log to FILE, as <PRIORITY>TEXT.", "FILE"},
                {"snapshot", "Save the session to FILE at its end, dated by the capture.", "FILE"},
                {"description", "Description to put in the snapshot.", "TEXT"},
                {"dlf", "Write the binary log of the snapshot to FILE.", "FILE"},
                {"resources", "Take the section templates from DIR.", "DIR"},
            },
        .exclusions = {{"summary", "diff"}, {"summary", "path"}, {"summary", "refresh-every"},
            {"summary", "snapshot"}, {"summary", "log"}, {"diff", "technology"}, {"diff", "snapshot"},
            {"diff", "refresh-every"}, {"diff", "dlf"}, {"diff", "log"}},
        .dependencies = {{"description", "snapshot"}},
        .argumentsSyntax = "INPUT...",
        .argumentsDescription =
            "Captures or snapshots (.orvex), not both. A capture is a DLF file or a pcap file with link type "
            "147 (USER0), one log message per packet; gzip and xz are undone. Databases of timelines "
            "(.sqlite) are merged into that of --timeline.",
    };
}

CommandLine::Program program()
{
    CommandLine::Program result = baseProgram();
    for (const char* option : kSampled) {
        for (const char* other : {"output", "format", "path", "refresh-every", "summary", "diff", "snapshot"})
            result.exclusions.push_back({option, other});
    }
    return result;
}

// Sets the task if the inputs are databases.
std::string readDatabases(const CommandLine& line, DecodeOptions& options)
{
    const auto databases = std::ranges::count_if(options.inputs, isDatabaseFile);
    if (databases == 0)
        return {};
    if (databases < std::ssize(options.inputs))
        return "Databases cannot be combined with other inputs.";
    if (!isDatabaseFile(line.value("timeline").value_or("")))
        return "Databases go with --timeline FILE.sqlite.";
    for (const char* option : {"report", "every", "field", "technology"}) {
        if (line.isSet(option))
            return "--" + std::string(option) + " goes with captures.";
    }
    options.task = DecodeOptions::Task::mergeDatabases;
    return {};
}

// A property list, or whatever is named like a snapshot.
bool isSnapshotFile(const std::string& path)
{
    if (path.ends_with(".orvex"))
        return true;
    if (path == kStandardStream)
        return false;
    std::array<std::uint8_t, 6> bytes{};
    RegularFile(path).readAt(0, bytes);
    const std::string beginning(bytes.begin(), bytes.end());
    return beginning.starts_with("<?xml") || beginning.starts_with("<plist") || beginning == "bplist";
}

// 0 when the text is not a number.
std::size_t numberIn(const std::string& text)
{
    std::size_t number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    return error == std::errc() && end == text.data() + text.size() ? number : 0;
}

// Each of these sets members from the command line and returns what is wrong with it; empty for nothing.

std::string readInputs(const CommandLine& line, DecodeOptions& options)
{
    options.inputs = line.arguments();
    if (options.inputs.empty())
        return "No capture or snapshot is given.";
    if (std::ranges::count(options.inputs, kStandardStream) > 1)
        return "Standard input is given more than once.";
    if (line.isSet("diff")) {
        options.task = DecodeOptions::Task::compareSnapshots;
        return options.inputs.size() == 2 ? "" : "--diff goes with two snapshots.";
    }
    const auto snapshots = std::ranges::count_if(options.inputs, isSnapshotFile);
    const bool areSnapshots = snapshots > 0;
    if (areSnapshots && snapshots < std::ssize(options.inputs))
        return "Captures and snapshots cannot be combined.";
    if (areSnapshots)
        options.task = DecodeOptions::Task::showSnapshots;

    for (const char* option : {"snapshot", "refresh-every", "summary", "timeline", "report"}) {
        if (areSnapshots && line.isSet(option))
            return "--" + std::string(option) + " goes with captures.";
    }
    if (line.isSet("summary"))
        options.task = DecodeOptions::Task::summarize;
    if (line.isSet("dlf") && (!areSnapshots || options.inputs.size() != 1))
        return "--dlf goes with one snapshot.";
    return {};
}

std::string readSampling(const CommandLine& line, DecodeOptions& options)
{
    const bool isSampled =
        std::ranges::any_of(kSampled, [&](const char* option) { return line.isSet(option); });
    for (const char* option : {"every", "field"}) {
        if (line.isSet(option) && !isSampled)
            return "--" + std::string(option) + " goes with --timeline or --report.";
    }
    if (!isSampled)
        return {};
    options.task = DecodeOptions::Task::sample;
    options.timelineFile = line.value("timeline");
    if (options.timelineFile == kStandardStream)
        options.timelineFile = "/dev/stdout";
    options.reportFile = line.value("report");
    if (options.reportFile == kStandardStream)
        options.reportFile = "/dev/stdout";
    if (options.inputs.size() > 1) {
        if (options.reportFile)
            return "--report goes with one capture.";
        if (!isDatabaseFile(*options.timelineFile))
            return "--timeline FILE.csv goes with one capture.";
    }
    return options.sampling.read(line.value("every"), line.values("field"));
}

std::string readDecoding(const CommandLine& line, DecodeOptions& options)
{
    options.technology = line.value("technology").value_or("");
    if (line.isSet("technology")
        && std::ranges::find(telephony::kTechnologies, options.technology)
            == std::end(telephony::kTechnologies))
        return "Unknown technology '" + options.technology + "'.";
    if (const auto number = line.value("refresh-every")) {
        options.refreshEvery = numberIn(*number);
        if (options.refreshEvery == 0)
            return "--refresh-every takes a number of messages, at least 1.";
    }
    options.resources = line.value("resources");
    options.description = line.value("description").value_or("");
    return {};
}

std::string readPrinting(const CommandLine& line, DecodeOptions& options)
{
    const std::string format = line.value("format").value_or("tree");
    if (format != "tree" && format != "json")
        return "Unknown format '" + format + "'.";
    options.format = format == "json" ? DecodeOptions::Format::json : DecodeOptions::Format::tree;
    options.path = line.value("path").value_or("/");
    if (!options.path.starts_with('/'))
        return "--path takes a path that begins with '/'.";
    options.isQuiet = line.isSet("quiet");

    if (line.value("output") != kStandardStream)
        options.outputFile = line.value("output");
    int printed = options.outputFile || options.task == DecodeOptions::Task::sample ? 0 : 1;
    for (const auto& file : {options.timelineFile, options.reportFile})
        printed += file == "/dev/stdout" ? 1 : 0;
    const std::pair<const char*, std::optional<std::string>*> files[] = {
        {"log", &options.logFile}, {"snapshot", &options.snapshotFile}, {"dlf", &options.dlfFile}};
    for (const auto& [option, file] : files) {
        *file = line.value(option);
        if (*file == kStandardStream) {
            *file = "/dev/stdout";
            ++printed;
        }
    }
    return printed > 1 ? "Only one output can go to standard output; --output FILE moves the tree." : "";
}

} // namespace

bool isDatabaseFile(const std::string& path)
{
    return path.ends_with(".sqlite") || path.ends_with(".sqlite3") || path.ends_with(".db");
}

DecodeOptions DecodeOptions::parse(int count, const char* const* arguments)
{
    DecodeOptions result;
    CommandLine line(program());
    result.earlyExit = line.parse(count, arguments);
    for (const auto read : {&readInputs, &readSampling, &readDatabases, &readDecoding, &readPrinting}) {
        if (result.earlyExit)
            break;
        if (const std::string error = read(line, result); !error.empty())
            result.earlyExit = line.wrongUsage(error);
    }
    return result;
}

} // namespace orvex
