#include "Options.h"

#include "FileConflict.h"
#include "FileStorage.h"
#include "TelephonyConstants.h"

#include <algorithm>
#include <charconv>
#include <filesystem>

namespace orvex::korat {

namespace {
constexpr double kLargestRate = 1e6;

CommandLine::Program program()
{
    return {
        .name = "koratd",
        .summary =
            "Stands in for a handset's telephony service: opens a log channel for a monitor and streams "
            "to it the messages of a capture, or what a modem says.",
        .options =
            {
                {"technology",
                    "Log technology: IFX, MRL_GSM, MRL_CDMA, MRL_LTE or MRL_UTRAN2. Default: MRL_LTE. A "
                    "modem "
                    "has no MRL_CDMA; its default is IFX, which shows everything, and auto follows its "
                    "serving "
                    "cell.",
                    "T"},
                {"source",
                    "What to stream from: capture, or modemmanager for the modem that ModemManager controls. "
                    "Default: capture.",
                    "S"},
                {"identities", "Show the IMEI and IMSI, which are left out otherwise. For a modem only."},
                {"measurements",
                    "Send RSRP and RSRQ of a modem's LTE cells, in the packet of connected mode, whatever "
                    "mode "
                    "the modem is in. For a modem only."},
                {"capture",
                    "Play this pcap or DLF file, again and again. Default: the technology's own, T.pcap.",
                    "FILE"},
                {"once", "Stop after playing the capture once."},
                {"rate", "Send N messages per second. Default: the capture's own pace.", "N"},
                {"count", "Stop after N messages per client.", "N"},
                {"record", "Write what is sent to a pcap file, at the capture's own pace.", "FILE"},
                {"fault",
                    "Misbehave: refuse-channel=CODE, null-port, no-reply, bad-reply, unknown-technology, "
                    "die-after=SECONDS or garbage=PERCENT. Repeatable.",
                    "F", true},
            },
    };
}

// A whole number or a decimal one; none for anything else.
template <typename Number>
std::optional<Number> number(const std::string& text)
{
    Number result = 0;
    const char* const end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, result);
    return error == std::errc() && stop == end ? std::optional(result) : std::nullopt;
}

// captures/ is in share/orvex when installed, and at the top of the source tree.
std::string defaultCapture(const std::string& technology)
{
    return std::filesystem::path(FileResources::dataDirectory(".")) / "captures" / (technology + ".pcap");
}

// Each of these returns what is wrong; empty if nothing is.

std::string readTechnology(const CommandLine& line, Options& options)
{
    const bool isModem = options.from == Options::From::modemManager;
    const std::string name =
        line.value("technology")
            .value_or(isModem ? telephony::kTechnologyIFX : telephony::kTechnologyMRL_LTE);
    if (isModem && name == "auto")
        return {};
    if (std::ranges::find(telephony::kTechnologies, name) == std::end(telephony::kTechnologies))
        return "Unknown technology '" + name + "'.";
    if (isModem && name == telephony::kTechnologyMRL_CDMA)
        return "A modem has no MRL_CDMA; IFX shows its CDMA cells.";
    options.technology = name;
    return {};
}

std::string readSource(const CommandLine& line, Options& options)
{
    const std::string source = line.value("source").value_or("capture");
    if (source != "capture" && source != "modemmanager")
        return "Unknown source '" + source + "'.";
    const bool isModem = source == "modemmanager";
    options.from = isModem ? Options::From::modemManager : Options::From::capture;
    options.identities = line.isSet("identities");
    options.measurements = line.isSet("measurements");
    for (const char* option : {"capture", "once", "rate"}) {
        if (isModem && line.isSet(option))
            return std::string("--") + option + " needs a capture, not a modem.";
    }
    for (const char* option : {"identities", "measurements"}) {
        if (!isModem && line.isSet(option))
            return std::string("--") + option + " needs --source modemmanager.";
    }
    return {};
}

std::string read(const CommandLine& line, Options& options)
{
    std::string wrong = readSource(line, options);
    if (wrong.empty())
        wrong = readTechnology(line, options);
    if (!wrong.empty())
        return wrong;
    if (options.from == Options::From::capture)
        options.capture = line.value("capture").value_or(defaultCapture(*options.technology));
    options.once = line.isSet("once");
    options.record = line.value("record");
    if (const auto rate = line.value("rate")) {
        options.rate = number<double>(*rate);
        if (!options.rate || !(*options.rate > 0) || *options.rate > kLargestRate)
            return "--rate takes a number of messages per second above 0 and up to 1000000.";
    }
    if (const auto count = line.value("count")) {
        options.count = number<std::uint64_t>(*count);
        if (!options.count)
            return "--count takes a number of messages.";
    }
    for (const std::string& fault : line.values("fault")) {
        if (!options.faults.add(fault))
            return "Unknown fault '" + fault + "'.";
    }
    return {};
}

// A conflict of files needs no usage: its line names both.
std::string conflictIn(const Options& options)
{
    if (!options.record || options.capture.empty())
        return {};
    return fileConflict({{"--capture " + options.capture, options.capture}},
        {{"--record " + *options.record, *options.record}});
}
} // namespace

Options Options::parse(int count, const char* const* arguments)
{
    Options result;
    CommandLine line(program());
    result.earlyExit = line.parse(count, arguments);
    if (result.earlyExit)
        return result;
    if (const std::string error = read(line, result); !error.empty())
        result.earlyExit = line.wrongUsage(error);
    else if (const std::string conflict = conflictIn(result); !conflict.empty())
        result.earlyExit = {CommandLine::kWrongUsage, "koratd: " + conflict + "\n"};
    return result;
}

} // namespace orvex::korat
