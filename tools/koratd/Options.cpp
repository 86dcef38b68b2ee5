#include "Options.h"

#include "FileConflict.h"
#include "Process.h"

#include <QCommandLineParser>

#include <cmath>

namespace orvex::korat {

namespace {
constexpr double kLargestRate = 1e6;

// A number in a text, within bounds (both included).
std::optional<double> realIn(const QString& text, double least, double most)
{
    bool isNumber = false;
    const double value = text.toDouble(&isNumber);
    return isNumber && value >= least && value <= most ? std::optional(value) : std::nullopt;
}

std::optional<int> integerIn(const QString& text, int least, int most)
{
    bool isNumber = false;
    const int value = text.toInt(&isNumber);
    return isNumber && value >= least && value <= most ? std::optional(value) : std::nullopt;
}

std::optional<std::uint64_t> count(const QString& text)
{
    bool isNumber = false;
    const qulonglong value = text.toULongLong(&isNumber);
    return isNumber ? std::optional<std::uint64_t>(value) : std::nullopt;
}

// Reads one fault, "name" or "name=value"; false when there is none like it.
bool readFault(const QString& text, Faults& faults)
{
    constexpr int kLargestError = 2'000'000'000;
    constexpr double kLongestLife = 1e6; // s

    const auto equals = text.indexOf('=');
    const QString name = text.left(equals);
    const QString value = equals < 0 ? QString() : text.mid(equals + 1);

    if (name == "refuse-channel") {
        faults.refuseChannel = integerIn(value, -kLargestError, kLargestError);
        return faults.refuseChannel.value_or(0) != 0; // 0 would be success
    }
    if (name == "die-after") {
        const auto seconds = realIn(value, 0, kLongestLife);
        if (seconds)
            faults.dieAfter = std::chrono::milliseconds(std::llround(*seconds * 1000));
        return seconds.has_value();
    }
    if (name == "garbage") {
        const auto percent = integerIn(value, 0, 100);
        faults.garbagePercent = percent.value_or(0);
        return percent.has_value();
    }
    static constexpr struct {
        const char* name;
        bool Faults::*flag;
    } kFlags[] = {
        {"null-port", &Faults::nullPort},
        {"no-reply", &Faults::noReply},
        {"bad-reply", &Faults::badReply},
        {"unknown-technology", &Faults::unknownTechnology},
    };
    for (const auto& each : kFlags) {
        if (text == each.name) {
            faults.*each.flag = true;
            return true;
        }
    }
    return false;
}

std::optional<std::string> file(const QCommandLineParser& parser, const char* option)
{
    return parser.isSet(option) ? std::optional(argumentBytes(parser.value(option))) : std::nullopt;
}

// Reads what is played and recorded; why it makes no sense, or nothing.
std::string readCaptures(const QCommandLineParser& parser, Options& options)
{
    options.replay = file(parser, "replay");
    options.record = file(parser, "record");
    options.isLooped = parser.isSet("loop");
    if (!options.replay)
        return options.isLooped ? "--loop goes with --replay" : "";
    for (const char* option : {"scenario", "seed"}) {
        if (parser.isSet(option))
            return std::string("--replay and --") + option + " exclude each other";
    }
    options.scenario = nullptr;
    return {};
}

// What is wrong with the files; empty when nothing is.
std::string conflictOf(const Options& options)
{
    if (!options.replay || !options.record)
        return {};
    return fileConflict({{"--replay " + *options.replay, *options.replay}},
        {{"--record " + *options.record, *options.record}});
}

// The options as they stand; the error is empty when all of them make sense.
std::string read(const QCommandLineParser& parser, Options& options)
{
    for (const char* option : {"technology", "scenario", "replay", "record", "rate", "count", "seed"}) {
        if (parser.values(option).size() > 1)
            return std::string("--") + option + " is given more than once";
    }
    const std::string technology = options.technology = argumentBytes(parser.value("technology"));
    const std::string scenario = argumentBytes(parser.value("scenario"));
    options.scenario = findScenario(technology, scenario);
    if (!findScenario(technology, {}))
        return "no scenario for the technology \"" + technology + "\"; known are: " + knownTechnologies();
    if (!options.scenario)
        return technology + " has no scenario \"" + scenario + "\"; known are: " + knownScenarios(technology);
    if (std::string error = readCaptures(parser, options); !error.empty())
        return error;
    if (parser.isSet("rate")) {
        options.rate = realIn(parser.value("rate"), 0, kLargestRate);
        if (options.rate.value_or(0) <= 0)
            return "--rate takes a number of packets per second above 0 and up to 1000000";
    }
    if (parser.isSet("count")) {
        options.count = count(parser.value("count"));
        if (!options.count)
            return "--count takes a number of packets";
    }
    const auto seed = count(parser.value("seed"));
    if (!seed)
        return "--seed takes a whole number";
    options.seed = *seed;
    for (const QString& fault : parser.values("fault")) {
        if (!readFault(fault, options.faults))
            return "no such fault: " + argumentBytes(fault);
    }
    if (!parser.positionalArguments().isEmpty())
        return "unexpected argument: " + argumentBytes(parser.positionalArguments().first());
    return {};
}
} // namespace

OptionsResult optionsFromArguments(const QStringList& arguments)
{
    QCommandLineParser parser;
    parser.setApplicationDescription(
        "Stands in for a handset's telephony service: opens the log channel to a "
        "monitor and streams the log messages of a scenario or a capture to it.");
    parser.addOptions({
        {{"h", "help"}, "Shows this help."},
        {{"v", "version"}, "Shows the version."},
        {"technology",
            QString::fromStdString("Log technology (default: MRL_LTE): " + knownTechnologies() + "."), "T",
            "MRL_LTE"},
        {"scenario", "What happens to the handset (default: the technology's first).", "NAME"},
        {"replay", "Plays a capture, pcap or DLF, in place of a scenario.", "FILE"},
        {"loop", "Plays the capture again and again."},
        {"record", "Writes what is streamed into a pcap file, at the scenario's or the capture's own pace.",
            "FILE"},
        {"rate", "Streams as many packets per second, instead of the scenario's or the capture's own pace.",
            "PACKETS_PER_SECOND"},
        {"count", "Rests after that many packets to a client.", "N"},
        {"seed", "Another seed makes another drive.", "N", "1"},
        {"fault",
            "Does something wrong; may be given repeatedly: refuse-channel=CODE, null-port, no-reply, "
            "bad-reply, unknown-technology, die-after=SECONDS, garbage=PERCENT.",
            "F"},
    });
    OptionsResult result;
    if (!parser.parse(arguments)) {
        result.error = argumentBytes(parser.errorText());
    } else if (parser.isSet("help")) {
        result.text = parser.helpText().toStdString();
        return result;
    } else if (parser.isSet("version")) {
        result.text = "koratd " ORVEX_VERSION "\n";
        return result;
    } else {
        Options options;
        result.error = read(parser, options);
        if (result.error.empty()) {
            result.error = conflictOf(options);
            if (result.error.empty())
                result.options = options;
            return result;
        }
    }
    if (!result.options)
        result.text = parser.helpText().toStdString();
    return result;
}

} // namespace orvex::korat
