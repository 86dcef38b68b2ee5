#include "CommandLine.h"

#include "Process.h"

#include <QCommandLineParser>
#include <QRegularExpression>

#include <algorithm>

namespace orvex {

namespace {

constexpr QSize kHandsetSize{375, 667};
constexpr int kBroadestHandset = 600; // the shorter side of its screen

// Pairs of which one option would be ignored.
constexpr struct {
    const char* option;
    const char* other;
} kExclusions[] = {
    {"light", "dark"},
    {"console", "light"},
    {"console", "dark"},
    {"console", "print-status"},
    {"console", "until-painted"},
    {"console", "size"},
    {"open", "resources"},
    {"open", "print-status"},
    {"open", "until-painted"},
};

CommandLine wrongUsage(const QString& error)
{
    CommandLine result;
    result.action = CommandLine::Action::wrongUsage;
    result.error = argumentBytes(error);
    return result;
}

// "375x667"; none for anything else.
std::optional<QSize> sizeFrom(const QString& text)
{
    static const QRegularExpression pattern(QStringLiteral("^([1-9][0-9]{0,3})x([1-9][0-9]{0,3})\\z"));
    const QRegularExpressionMatch match = pattern.match(text);
    if (!match.hasMatch())
        return std::nullopt;
    return QSize(match.captured(1).toInt(), match.captured(2).toInt());
}

} // namespace

CommandLine CommandLine::parse(const QStringList& arguments)
{
    const QCommandLineOption help(QStringList{QStringLiteral("h"), QStringLiteral("help")});
    const QCommandLineOption version(QStringList{QStringLiteral("v"), QStringLiteral("version")});
    const QCommandLineOption console(QStringLiteral("console"));
    const QCommandLineOption resources(QStringLiteral("resources"), {}, QStringLiteral("DIR"));
    const QCommandLineOption open(QStringLiteral("open"), {}, QStringLiteral("FILE"));
    const QCommandLineOption printStatus(QStringLiteral("print-status"));
    const QCommandLineOption light(QStringLiteral("light"));
    const QCommandLineOption dark(QStringLiteral("dark"));
    const QCommandLineOption size(QStringLiteral("size"), {}, QStringLiteral("SIZE"));
    const QCommandLineOption untilPainted(QStringLiteral("until-painted"));
    QCommandLineParser parser;
    parser.addOptions(
        {help, version, console, resources, open, printStatus, light, dark, size, untilPainted});

    // parse() rather than process(), which would end the program in its own way.
    if (!parser.parse(arguments))
        return wrongUsage(parser.errorText());
    if (!parser.positionalArguments().isEmpty())
        return wrongUsage(
            QStringLiteral("Unexpected argument '%1'.").arg(parser.positionalArguments().first()));

    CommandLine result;
    if (parser.isSet(help) || parser.isSet(version)) {
        result.action = parser.isSet(help) ? Action::help : Action::version;
        return result;
    }
    for (const auto& [option, other] : kExclusions) {
        if (parser.isSet(QLatin1String(option)) && parser.isSet(QLatin1String(other)))
            return wrongUsage(QStringLiteral("--%1 cannot be combined with --%2.")
                                  .arg(QLatin1String(option), QLatin1String(other)));
    }
    for (const auto& option : {resources, open, size}) {
        if (parser.values(option).size() > 1)
            return wrongUsage(QStringLiteral("--%1 is given more than once.").arg(option.names().first()));
    }

    if (parser.isSet(size)) {
        result.fillsHandset = parser.value(size) == QLatin1String("handset");
        result.size = result.fillsHandset ? kHandsetSize : sizeFrom(parser.value(size));
        if (!result.size)
            return wrongUsage(QStringLiteral("--size takes WIDTHxHEIGHT, such as 375x667, or 'handset'."));
    }
    if (parser.isSet(console))
        result.action = Action::console;
    result.printsStatus = parser.isSet(printStatus);
    result.endsWhenPainted = parser.isSet(untilPainted);
    if (parser.isSet(light))
        result.theme = Theme::Mode::light;
    if (parser.isSet(dark))
        result.theme = Theme::Mode::dark;
    if (parser.isSet(resources))
        result.resources = argumentBytes(parser.value(resources));
    if (parser.isSet(open))
        result.snapshot = argumentBytes(parser.value(open));
    return result;
}

std::optional<QSize> CommandLine::windowSizeOn(const QSize& screen) const
{
    if (fillsHandset && std::min(screen.width(), screen.height()) <= kBroadestHandset)
        return std::nullopt;
    return size;
}

std::string CommandLine::usage()
{
    return "Usage: orvex [options]\n"
           "Shows what the handset's baseband reports.\n"
           "\n"
           "Options:\n"
           "  --console        Write to the terminal instead of opening a window.\n"
           "  --open FILE      Show a saved snapshot instead of a session.\n"
           "  --print-status   Write the status line to standard output whenever it changes,\n"
           "                   after the number of messages decoded so far.\n"
           "  --resources DIR  Take the section templates from this directory.\n"
           "  --light, --dark  Choose the colours. Default: the desktop's.\n"
           "  --size WxH       Open the window at this size instead of filling the screen. 'handset'\n"
           "                   is 375x667, or the whole screen on a handset.\n"
           "  --until-painted  Print 'painted' after the first frame, then exit.\n"
           "  -h, --help       Show this help and exit.\n"
           "  -v, --version    Show the version and exit.\n";
}

} // namespace orvex
