#include "Options.h"

#include "FileConflict.h"
#include "FileStorage.h"
#include "Process.h"
#include "TelephonyConstants.h"

#include <QCommandLineParser>

#include <algorithm>
#include <filesystem>

namespace orvex::korat {

namespace {
constexpr double kLargestRate = 1e6;

constexpr const char* kTechnologies[] = {telephony::kTechnologyMRL_GSM, telephony::kTechnologyMRL_LTE,
    telephony::kTechnologyMRL_UTRAN2, telephony::kTechnologyMRL_CDMA, telephony::kTechnologyIFX};

std::string knownTechnologies()
{
    std::string result;
    for (const char* technology : kTechnologies)
        result += (result.empty() ? "" : ", ") + std::string(technology);
    return result;
}

std::optional<double> rate(const QString& text)
{
    bool isNumber = false;
    const double value = text.toDouble(&isNumber);
    return isNumber && value > 0 && value <= kLargestRate ? std::optional(value) : std::nullopt;
}

std::optional<std::uint64_t> count(const QString& text)
{
    bool isNumber = false;
    const qulonglong value = text.toULongLong(&isNumber);
    return isNumber ? std::optional<std::uint64_t>(value) : std::nullopt;
}

std::optional<std::string> file(const QCommandLineParser& parser, const char* option)
{
    return parser.isSet(option) ? std::optional(argumentBytes(parser.value(option))) : std::nullopt;
}

// In the source tree, captures/ lies where share/orvex/captures/ lies in an installation.
std::string defaultCapture(const std::string& technology)
{
    return std::filesystem::path(FileResources::dataDirectory(".")) / "captures" / (technology + ".pcap");
}

// The options as they stand; the error is empty when all of them make sense.
std::string read(const QCommandLineParser& parser, Options& options)
{
    for (const char* option : {"technology", "capture", "record", "rate", "count"}) {
        if (parser.values(option).size() > 1)
            return std::string("--") + option + " is given more than once";
    }
    options.technology = argumentBytes(parser.value("technology"));
    if (std::ranges::find(kTechnologies, options.technology) == std::end(kTechnologies))
        return "unknown technology \"" + options.technology + "\"; known are: " + knownTechnologies();
    options.capture = file(parser, "capture").value_or(defaultCapture(options.technology));
    options.record = file(parser, "record");
    options.once = parser.isSet("once");
    if (parser.isSet("rate")) {
        options.rate = rate(parser.value("rate"));
        if (!options.rate)
            return "--rate takes a number of messages per second above 0 and up to 1000000";
    }
    if (parser.isSet("count")) {
        options.count = count(parser.value("count"));
        if (!options.count)
            return "--count takes a number of messages";
    }
    for (const QString& fault : parser.values("fault")) {
        if (!options.faults.add(argumentBytes(fault)))
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
        "Stands in for a handset's telephony service: opens a log channel to a monitor and streams the log "
        "messages of a capture to it.");
    parser.addOptions({
        {{"h", "help"}, "Show this help."},
        {{"v", "version"}, "Show the version."},
        {"technology",
            QString::fromStdString("Log technology (default: MRL_LTE): " + knownTechnologies() + "."), "T",
            "MRL_LTE"},
        {"capture",
            "Play this capture, pcap or DLF, again and again (default: the technology's own, T.pcap).",
            "FILE"},
        {"once", "Play the capture once, then rest."},
        {"record", "Write what is streamed into a pcap file, at the capture's own pace.", "FILE"},
        {"rate", "Stream this many messages per second instead of at the capture's own pace.",
            "MESSAGES_PER_SECOND"},
        {"count", "Rest after this many messages to a client.", "N"},
        {"fault",
            "Misbehave; may be given repeatedly: refuse-channel=CODE, null-port, no-reply, bad-reply, "
            "unknown-technology, die-after=SECONDS, garbage=PERCENT.",
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
            const auto files = options.record
                ? std::vector<FileInUse>{{"--record " + *options.record, *options.record}}
                : std::vector<FileInUse>();
            result.error = fileConflict({{"--capture " + options.capture, options.capture}}, files);
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
