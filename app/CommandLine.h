#pragma once

#include "Theme.h"

#include <QSize>
#include <QStringList>

#include <optional>
#include <string>

namespace orvex {

// What the user asked for when starting the program.
struct CommandLine {
    enum class Action { window, console, help, version, wrongUsage };

    Action action = Action::window;
    Theme::Mode theme = Theme::Mode::system;
    std::optional<std::string> resources; // a directory in place of the default one
    std::optional<std::string> snapshot;  // a file to show in place of a session
    bool printsStatus = false;            // the window's status line goes to standard output too
    bool endsWhenPainted = false;         // to measure how long the start takes
    std::optional<QSize> size;            // the window's, in points; none is the screen's
    bool fillsHandset = false;            // the size is for larger screens only
    std::string error;                    // with wrongUsage: one line

    // The arguments as argumentTexts() gives them, the name of the program first.
    static CommandLine parse(const QStringList& arguments);
    // The size the window opens with on such a screen; none is the screen's.
    std::optional<QSize> windowSizeOn(const QSize& screen) const;
    static std::string usage();
};

} // namespace orvex
