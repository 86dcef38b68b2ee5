#include "DecodeOptions.h"

#include "LogGenerator.h"
#include "Process.h"
#include "RegularFile.h"

#include <QCommandLineParser>

#include <algorithm>
#include <array>

namespace orvex {

namespace {

constexpr int kMostJobs = 256;

DecodeOptions wrongUsage(const QString& error)
{
    DecodeOptions result;
    result.action = DecodeOptions::Action::wrongUsage;
    result.error = argumentBytes(error);
    return result;
}

// A property list, or what is called a snapshot whatever it is.
bool isSnapshotFile(const std::string& path)
{
    if (path.ends_with(".orvex"))
        return true;
    std::array<std::uint8_t, 6> bytes{};
    RegularFile(path).readAt(0, bytes);
    const std::string beginning(bytes.begin(), bytes.end());
    return beginning.starts_with("<?xml") || beginning.starts_with("<plist") || beginning == "bplist";
}

std::optional<std::string> valueOf(const QCommandLineParser& parser, const QCommandLineOption& option)
{
    if (!parser.isSet(option))
        return std::nullopt;
    return argumentBytes(parser.value(option));
}

// False when the option is there and its value is no number from 1 on.
bool readNumber(const QCommandLineParser& parser, const QCommandLineOption& option, std::size_t& number)
{
    if (!parser.isSet(option))
        return true;
    bool isNumber = false;
    number = parser.value(option).toULongLong(&isNumber);
    return isNumber && number > 0;
}

} // namespace

DecodeOptions DecodeOptions::parse(int count, char** arguments)
{
    const auto withValue = [](const char* name) {
        return QCommandLineOption(QString::fromLatin1(name), {}, QStringLiteral("VALUE"));
    };
    const QCommandLineOption help(QStringList{QStringLiteral("h"), QStringLiteral("help")});
    const QCommandLineOption version(QStringList{QStringLiteral("v"), QStringLiteral("version")});
    const QCommandLineOption technology = withValue("technology");
    const QCommandLineOption format = withValue("format");
    const QCommandLineOption refreshEvery = withValue("refresh-every");
    const QCommandLineOption resources = withValue("resources");
    const QCommandLineOption output = withValue("output");
    const QCommandLineOption log = withValue("log");
    const QCommandLineOption snapshot = withValue("snapshot");
    const QCommandLineOption description = withValue("description");
    const QCommandLineOption dlf = withValue("dlf");
    const QCommandLineOption jobs = withValue("jobs");
    QCommandLineParser parser;
    const QList<QCommandLineOption> once{
        technology, format, refreshEvery, resources, output, log, snapshot, description, dlf, jobs};
    parser.addOptions(once + QList{help, version});

    // parse() rather than process(), which would end the program in its own way.
    if (!parser.parse(argumentTexts(count, arguments)))
        return wrongUsage(parser.errorText());

    DecodeOptions result;
    if (parser.isSet(help) || parser.isSet(version)) {
        result.action = parser.isSet(help) ? Action::help : Action::version;
        return result;
    }
    for (const QCommandLineOption& option : once) {
        if (parser.values(option).size() > 1)
            return wrongUsage(QStringLiteral("--%1 is given more than once.").arg(option.names().first()));
    }
    result.technology = argumentBytes(parser.value(technology));
    for (const QString& capture : parser.positionalArguments())
        result.captures.push_back(argumentBytes(capture));
    if (result.captures.empty())
        return wrongUsage(QStringLiteral("No capture is named."));
    const auto snapshots = std::ranges::count_if(result.captures, isSnapshotFile);
    result.areSnapshots = snapshots > 0;
    if (result.areSnapshots && snapshots < std::ssize(result.captures))
        return wrongUsage(QStringLiteral("Snapshots and captures do not go together."));
    if (result.technology.empty() && !result.areSnapshots)
        return wrongUsage(QStringLiteral("--technology is missing."));
    if (!result.technology.empty()
        && std::ranges::find(technologies(), result.technology, &Technology::identifier)
            == technologies().end())
        return wrongUsage(QStringLiteral("Unknown technology '%1'.").arg(parser.value(technology)));
    if (parser.isSet(format)) {
        if (parser.value(format) == QLatin1String("json"))
            result.format = Format::json;
        else if (parser.value(format) != QLatin1String("tree"))
            return wrongUsage(QStringLiteral("Unknown format '%1'.").arg(parser.value(format)));
    }
    if (!readNumber(parser, refreshEvery, result.refreshEvery))
        return wrongUsage(QStringLiteral("--refresh-every takes a number of messages from 1 on."));
    if (!readNumber(parser, jobs, result.jobs) || result.jobs > kMostJobs)
        return wrongUsage(QStringLiteral("--jobs takes a number from 1 to %1.").arg(kMostJobs));
    result.resources = valueOf(parser, resources);
    result.outputFile = valueOf(parser, output);
    result.logFile = valueOf(parser, log);
    result.snapshotFile = valueOf(parser, snapshot);
    result.description = argumentBytes(parser.value(description));
    result.dlfFile = valueOf(parser, dlf);
    if (result.snapshotFile && result.areSnapshots)
        return wrongUsage(QStringLiteral("--snapshot saves what captures hold, not another snapshot."));
    if (parser.isSet(refreshEvery) && result.areSnapshots)
        return wrongUsage(QStringLiteral("--refresh-every goes with captures."));
    if (parser.isSet(description) && !result.snapshotFile)
        return wrongUsage(QStringLiteral("--description goes with --snapshot."));
    if (result.jobs > 0 && result.areSnapshots)
        return wrongUsage(QStringLiteral("--jobs decodes captures, not snapshots."));
    if (result.jobs > 0 && result.snapshotFile)
        return wrongUsage(
            QStringLiteral("--snapshot saves one session; with --jobs each capture has its own."));
    if (result.dlfFile && (!result.areSnapshots || result.captures.size() > 1))
        return wrongUsage(QStringLiteral("--dlf takes the binary log out of one snapshot."));
    return result;
}

const char* DecodeOptions::usage()
{
    return "Usage: orvex-decode --technology T [options] CAPTURE...\n"
           "       orvex-decode [--technology T] [options] SNAPSHOT...\n"
           "Decodes the log messages of captures, in order, and prints the display tree.\n"
           "Of snapshots it prints what they store; with --technology also what their raw\n"
           "messages are decoded to now.\n"
           "\n"
           "A capture is a pcap file with link type 147 (USER0), one log message per packet, or\n"
           "a DLF file. A snapshot is an .orvex file.\n"
           "T is IFX, MRL_GSM, MRL_CDMA, MRL_LTE or MRL_UTRAN2.\n"
           "No output may be one of the inputs or another output.\n"
           "\n"
           "Options:\n"
           "  --format tree|json   How to print the tree. Default: tree. JSON gives each node its\n"
           "                       path, except in trees of 32 levels or more, which are printed\n"
           "                       on one line without paths.\n"
           "  --refresh-every N    Ask for the display after every N messages too, as a session\n"
           "                       does every two seconds. Default: at the end alone.\n"
           "  --jobs N             Decode each capture in a session of its own, N of them at a time,\n"
           "                       and print their trees one after another, in order. Without it\n"
           "                       one session takes all captures, and prints one tree.\n"
           "  --output FILE        Print into this file.\n"
           "  --log FILE           Write every line of the system log into this file, as\n"
           "                       <PRIORITY>TEXT.\n"
           "  --snapshot FILE      Save the session at its end as a snapshot.\n"
           "  --description TEXT   What to say in the snapshot.\n"
           "  --dlf FILE           Write the binary log of the snapshot into this file.\n"
           "  --resources DIR      Take the section templates from this directory.\n"
           "  -h, --help           Show this help and exit.\n"
           "  -v, --version        Show the version and exit.\n";
}

} // namespace orvex
