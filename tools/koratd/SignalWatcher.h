#pragma once

#include <functional>
#include <memory>

class QSocketNotifier;

namespace orvex::korat {

// Turns SIGTERM and SIGINT into a call on the event loop. From its making on the signals wait for that;
// threads that were started earlier would still take them, so it is made first.
class SignalWatcher {
public:
    SignalWatcher();
    ~SignalWatcher();
    SignalWatcher(const SignalWatcher&) = delete;
    SignalWatcher& operator=(const SignalWatcher&) = delete;

    void watch(std::function<void()> onSignal);

private:
    int _descriptor;
    std::unique_ptr<QSocketNotifier> _notifier;
};

} // namespace orvex::korat
