#pragma once

#include "RunLoop.h"

#include <functional>
#include <memory>

namespace orvex {

// Calls back after 10 seconds of silence, and when it ends.
class SilenceWatch {
public:
    // The run loop must outlive the watch, which starts with the first heard().
    SilenceWatch(RunLoop& runLoop, std::function<void(bool isSilent)> onChange);

    void heard();

private:
    void setSilent(bool isSilent);

    RunLoop& _runLoop;
    std::function<void(bool isSilent)> _onChange;
    std::unique_ptr<RunLoop::Timer> _timer;
    bool _isSilent = false;
};

} // namespace orvex
