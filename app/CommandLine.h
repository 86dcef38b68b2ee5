#pragma once

#include "Theme.h"

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
    std::string error;                    // with wrongUsage: one line

    // The arguments as the program got them, its own name first.
    static CommandLine parse(const QStringList& arguments);
    static std::string usage();
};

} // namespace orvex
