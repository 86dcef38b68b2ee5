#pragma once

#include <QSocketNotifier>

#include <functional>
#include <memory>

namespace orvex {

// Turns SIGINT, SIGTERM and SIGHUP into a call on the event loop. At most one object at a time; when it goes
// the signals have their former effect again.
//
// A process that has not ended one second after a signal, as it waits for a reader, a bus or a service, dies
// of that signal.
class TerminationSignals {
public:
    explicit TerminationSignals(std::function<void()> onSignal);
    ~TerminationSignals();
    TerminationSignals(const TerminationSignals&) = delete;
    TerminationSignals& operator=(const TerminationSignals&) = delete;

private:
    int _readEnd = -1;
    int _writeEnd = -1;
    std::unique_ptr<QSocketNotifier> _notifier;
};

} // namespace orvex
