#include "AppOptions.h"

#include <QRegularExpression>

#include <algorithm>

namespace orvex {

namespace {

constexpr QSize kHandsetSize{375, 667};
constexpr int kBroadestHandset = 600; // the shorter side of its screen

CommandLine::Program program()
{
    return {
        .name = "orvex",
        .summary = "Shows what the handset's baseband reports.",
        .options =
            {
                {"console", "Write to the terminal instead of opening a window."},
                {"open", "Show a saved snapshot instead of a session.", "FILE"},
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
                {"open", "resources"},
                {"open", "print-status"},
                {"open", "until-painted"},
            },
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
    result.usesConsole = line.isSet("console");
    result.printsStatus = line.isSet("print-status");
    result.endsWhenPainted = line.isSet("until-painted");
    if (line.isSet("light"))
        result.theme = Theme::Mode::light;
    if (line.isSet("dark"))
        result.theme = Theme::Mode::dark;
    result.resources = line.value("resources");
    result.snapshot = line.value("open");
    return result;
}

std::optional<QSize> AppOptions::windowSizeOn(const QSize& screen) const
{
    if (fillsHandset && std::min(screen.width(), screen.height()) <= kBroadestHandset)
        return std::nullopt;
    return size;
}

} // namespace orvex
