#include "DecodeOptions.h"

#include "RegularFile.h"
#include "TelephonyConstants.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace orvex {

namespace {

CommandLine::Program program()
{
    return {
        .name = "orvex-decode",
        .summary = "Decodes the log messages of captures, in order, in one session, and prints the display "
                   "tree. Of snapshots it prints what they store and, with --technology, what their raw "
                   "messages decode to now. No output may be one of the inputs or another output.",
        .options =
            {
                {"technology",
                    "Technology of the messages: IFX, MRL_GSM, MRL_CDMA, MRL_LTE or MRL_UTRAN2. Required for "
                    "captures.",
                    "T"},
                {"format",
                    "How to print the tree. JSON gives the path of each node, except in trees of 32 levels "
                    "or more, which go on one line without paths. Default: tree.",
                    "tree|json"},
                {"refresh-every",
                    "Also ask for the display after every N messages, as a session does every two seconds. "
                    "Default: only at the end.",
                    "N"},
                {"output", "Print to FILE.", "FILE"},
                {"log", "Write every line of the system log to FILE, as <PRIORITY>TEXT.", "FILE"},
                {"snapshot", "Save the session to FILE at its end.", "FILE"},
                {"description", "Description to put in the snapshot.", "TEXT"},
                {"dlf", "Write the binary log of the snapshot to FILE.", "FILE"},
                {"resources", "Take the section templates from DIR.", "DIR"},
            },
        .dependencies = {{"description", "snapshot"}},
        .argumentsSyntax = "INPUT...",
        .argumentsDescription = "Captures or snapshots (.orvex), not both. A capture is a DLF file or a pcap "
                                "file with link type 147 (USER0), one log message per packet.",
    };
}

// A property list, or whatever is named like a snapshot.
bool isSnapshotFile(const std::string& path)
{
    if (path.ends_with(".orvex"))
        return true;
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

// Sets the members from the command line. Returns what is wrong with it; empty for nothing.
std::string read(const CommandLine& line, DecodeOptions& options)
{
    options.inputs = line.arguments();
    if (options.inputs.empty())
        return "No capture or snapshot is given.";
    const auto snapshots = std::ranges::count_if(options.inputs, isSnapshotFile);
    options.areSnapshots = snapshots > 0;
    if (options.areSnapshots && snapshots < std::ssize(options.inputs))
        return "Captures and snapshots cannot be combined.";

    options.technology = line.value("technology").value_or("");
    if (options.technology.empty() && !options.areSnapshots)
        return "--technology is required for captures.";
    if (!options.technology.empty()
        && std::ranges::find(telephony::kTechnologies, options.technology)
            == std::end(telephony::kTechnologies))
        return "Unknown technology '" + options.technology + "'.";

    const std::string format = line.value("format").value_or("tree");
    if (format != "tree" && format != "json")
        return "Unknown format '" + format + "'.";
    options.format = format == "json" ? DecodeOptions::Format::json : DecodeOptions::Format::tree;

    if (const auto number = line.value("refresh-every")) {
        options.refreshEvery = numberIn(*number);
        if (options.refreshEvery == 0)
            return "--refresh-every takes a number of messages, at least 1.";
    }
    options.resources = line.value("resources");
    options.outputFile = line.value("output");
    options.logFile = line.value("log");
    options.snapshotFile = line.value("snapshot");
    options.description = line.value("description").value_or("");
    options.dlfFile = line.value("dlf");

    for (const char* option : {"snapshot", "refresh-every"}) {
        if (options.areSnapshots && line.isSet(option))
            return "--" + std::string(option) + " goes with captures.";
    }
    if (options.dlfFile && (!options.areSnapshots || options.inputs.size() > 1))
        return "--dlf goes with one snapshot.";
    return {};
}

} // namespace

DecodeOptions DecodeOptions::parse(int count, const char* const* arguments)
{
    DecodeOptions result;
    CommandLine line(program());
    result.earlyExit = line.parse(count, arguments);
    if (result.earlyExit)
        return result;
    if (const std::string error = read(line, result); !error.empty())
        result.earlyExit = line.wrongUsage(error);
    return result;
}

} // namespace orvex
