#pragma once

#include "RunLoop.h"

#include <functional>
#include <memory>

namespace orvex {

// Tells when nothing has been heard for 10 seconds, and when something is heard again.
class SilenceWatch {
public:
    // The run loop outlives the watch, which begins with the first heard().
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
