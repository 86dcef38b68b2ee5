#pragma once

#include "CommandLine.h"
#include "ConsoleOptions.h"
#include "Theme.h"

#include <QSize>

#include <optional>
#include <string>

namespace orvex {

// What the user asked of the application.
struct AppOptions {
    // The arguments as the program got them, its own name first.
    static AppOptions parse(int count, const char* const* arguments);
    // The size to open the window with on such a screen; absent: the screen's.
    std::optional<QSize> windowSizeOn(const QSize& screen) const;

    // Where the templates are.
    std::string resourceDirectory() const;

    std::optional<CommandLine::EarlyExit> earlyExit; // instead of running; nothing else is valid then

    bool diagnoses = false;   // instead of running a session
    bool usesConsole = false; // else a window
    ConsoleOptions console;
    Theme::Mode theme = Theme::Mode::system;
    std::optional<std::string> resources; // absent: the default directory
    std::optional<std::string> file;      // to show instead of a session
    bool alerts = false;                  // report in a window, too, why the file cannot be shown
    bool printsStatus = false;            // print the window's status line
    bool endsWhenPainted = false;         // to measure how long the start takes
    std::optional<QSize> size;            // of the window, in points; absent: the screen's
    bool fillsHandset = false;            // the size is only for screens larger than a handset's
};

} // namespace orvex
