#pragma once

#include "AppPlatform.h"
#include "ConsoleOutput.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex {

// The application without a window: writes the status line and the display tree at every refresh. On a
// terminal each frame takes the place of the one before; elsewhere blank lines separate them.
class OrvexConsole final : public OrvexModelListener {
public:
    OrvexConsole(const AppPlatform& platform, ConsoleOutput& output);
    ~OrvexConsole() override;
    OrvexConsole(const OrvexConsole&) = delete;
    OrvexConsole& operator=(const OrvexConsole&) = delete;

    // Says that it is connecting and queues the start of the session.
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
