#pragma once

#include "AppPlatform.h"
#include "ConsoleOptions.h"
#include "ConsoleOutput.h"
#include "ConsoleView.h"
#include "TimelineRecording.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <utility>

namespace orvex {

// The application without a window: shows the status line and the display tree, or a branch of it, at every
// refresh.
class OrvexConsole final : public OrvexModelListener {
public:
    // The view outlives the console.
    OrvexConsole(const AppPlatform& platform, ConsoleView& view, ConsoleOptions options = {});
    ~OrvexConsole() override;
    OrvexConsole(const OrvexConsole&) = delete;
    OrvexConsole& operator=(const OrvexConsole&) = delete;

    // Shows that it is connecting and queues the start of the session. `onEnd` is called once when the
    // options say that it is time to end.
    void start(std::function<void()> onEnd = {});
    // Ends the recording, saves a snapshot if asked to, writes the home-screen preference and closes the
    // session. Further calls do nothing.
    void applicationWillTerminate();

    // Why the program has failed, in one line; empty if it has not.
    const std::string& failure() const { return _failure; }

    void updateViewControllerFromModel() override;

private:
    void checkConnection();
    void sayConnecting();
    void show(const std::string& status, const OrvexModelNodeRef& tree);
    bool startRecording();
    void record();
    void timeIsUp();
    void save();
    void end();

    AppPlatform _platform;
    ConsoleView& _view;
    ConsoleOptions _options;
    std::function<void()> _onEnd;
    std::shared_ptr<OrvexModel> _model;
    std::unique_ptr<RunLoop::Timer> _connectionTimer;
    std::unique_ptr<RunLoop::Timer> _timeout;
    std::optional<TimelineRecording> _recording;
    std::unique_ptr<RunLoop::Timer> _recordingTimer;
    std::uint64_t _recordedMessages = 0; // up to the last sample
    OrvexModelNodeRef _tree;             // of the last update
    bool _saidConnecting = false;        // and nothing else since
    bool _cameUp = false;                // the session did, at some time
    std::string _failure;
};

} // namespace orvex
