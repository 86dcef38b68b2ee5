#include "DecodeOptions.h"

#include "TelephonyConstants.h"

#include <QCommandLineParser>

#include <algorithm>

namespace orvex {

namespace {

constexpr const char* kTechnologies[] = {telephony::kTechnologyIFX, telephony::kTechnologyMRL_GSM,
    telephony::kTechnologyMRL_CDMA, telephony::kTechnologyMRL_LTE, telephony::kTechnologyMRL_UTRAN2};

DecodeOptions wrongUsage(const QString& error)
{
    DecodeOptions result;
    result.action = DecodeOptions::Action::wrongUsage;
    result.error = error.toStdString();
    return result;
}

std::optional<std::string> valueOf(const QCommandLineParser& parser, const QCommandLineOption& option)
{
    if (!parser.isSet(option))
        return std::nullopt;
    return parser.value(option).toStdString();
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
    QCommandLineParser parser;
    parser.addOptions({help, version, technology, format, refreshEvery, resources, output, log});

    QStringList list;
    for (int i = 0; i < count; ++i)
        list.append(QString::fromLocal8Bit(arguments[i]));
    // parse() rather than process(), which would end the program in its own way.
    if (!parser.parse(list))
        return wrongUsage(parser.errorText());

    DecodeOptions result;
    if (parser.isSet(help) || parser.isSet(version)) {
        result.action = parser.isSet(help) ? Action::help : Action::version;
        return result;
    }
    result.technology = parser.value(technology).toStdString();
    if (result.technology.empty())
        return wrongUsage(QStringLiteral("--technology is missing."));
    if (std::ranges::find(kTechnologies, result.technology) == std::end(kTechnologies))
        return wrongUsage(QStringLiteral("Unknown technology '%1'.").arg(parser.value(technology)));
    if (parser.isSet(format)) {
        if (parser.value(format) == QLatin1String("json"))
            result.format = Format::json;
        else if (parser.value(format) != QLatin1String("tree"))
            return wrongUsage(QStringLiteral("Unknown format '%1'.").arg(parser.value(format)));
    }
    if (parser.isSet(refreshEvery)) {
        bool isNumber = false;
        result.refreshEvery = parser.value(refreshEvery).toULongLong(&isNumber);
        if (!isNumber || result.refreshEvery == 0)
            return wrongUsage(QStringLiteral("--refresh-every takes a number of messages from 1 on."));
    }
    result.resources = valueOf(parser, resources);
    result.outputFile = valueOf(parser, output);
    result.logFile = valueOf(parser, log);
    for (const QString& capture : parser.positionalArguments())
        result.captures.push_back(capture.toLocal8Bit().toStdString());
    if (result.captures.empty())
        return wrongUsage(QStringLiteral("No capture is named."));
    return result;
}

const char* DecodeOptions::usage()
{
    return "Usage: orvex-decode --technology T [options] CAPTURE...\n"
           "Decodes the log messages of captures, in order, and prints the display tree.\n"
           "\n"
           "A capture is a pcap file with link type 147 (USER0), one log message per packet.\n"
           "T is IFX, MRL_GSM, MRL_CDMA, MRL_LTE or MRL_UTRAN2.\n"
           "\n"
           "Options:\n"
           "  --format tree|json   How to print the tree. Default: tree.\n"
           "  --refresh-every N    Ask for the display after every N messages too, as a session\n"
           "                       does every two seconds. Default: at the end alone.\n"
           "  --output FILE        Print into this file.\n"
           "  --log FILE           Write every line of the system log into this file, as\n"
           "                       <PRIORITY>TEXT.\n"
           "  --resources DIR      Take the section templates from this directory.\n"
           "  -h, --help           Show this help and exit.\n"
           "  -v, --version        Show the version and exit.\n";
}

} // namespace orvex
