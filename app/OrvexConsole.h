#pragma once

#include "AppPlatform.h"
#include "ConsoleOutput.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex {

// A screenful: the status line above the body. A body taller than the terminal goes into columns where these
// are wide enough to read; if it still does not fit, its last line says how much is missing. Lines are cut to
// their column.
std::vector<std::string> terminalFrame(
    const std::string& status, const std::vector<std::string>& body, TerminalSize size);

// Cuts a text to a number of terminal cells, with an ellipsis where something is missing, and pads it with
// blanks if asked. The text is UTF-8 without control characters.
std::string fittedToCells(const std::string& text, int cells, bool padded);

// The application without a window: writes the status line and the display tree at every refresh. On a
// terminal each frame replaces the last; elsewhere a blank line separates them.
class OrvexConsole final : public OrvexModelListener {
public:
    OrvexConsole(const AppPlatform& platform, ConsoleOutput& output);
    ~OrvexConsole() override;
    OrvexConsole(const OrvexConsole&) = delete;
    OrvexConsole& operator=(const OrvexConsole&) = delete;

    // Writes that it is connecting and queues the start of the session.
    void start();
    // Writes the home-screen preference and closes the session. Further calls do nothing.
    void applicationWillTerminate();

    void updateViewControllerFromModel() override;

private:
    void checkConnection();
    void sayConnecting();
    void write(const std::string& status);

    AppPlatform _platform;
    ConsoleOutput& _output;
    std::shared_ptr<OrvexModel> _model;
    std::unique_ptr<RunLoop::Timer> _connectionTimer;
    std::vector<std::string> _tree; // lines of the last update
    bool _saidConnecting = false;   // and nothing else since
    bool _wroteBefore = false;
};

} // namespace orvex
