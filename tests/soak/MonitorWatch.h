#pragma once

#include "MonitorProgram.h"
#include "Range.h"

namespace orvex::soak {

// The checks on what the monitor shows and decodes in the course of one step. Each fails by a Disappointment.
class MonitorWatch {
public:
    using Milliseconds = std::chrono::milliseconds;

    // Everything may take so much longer than it should.
    MonitorWatch(MonitorProgram& monitor, Milliseconds slack)
        : _monitor(monitor)
        , _slack(slack)
    {
    }

    // After the start there is no service.
    void awaitLaunch();
    void beginStep();
    long decodedInStep() const { return _monitor.status().decoded - _decodedBefore; }

    // A service has come. Waits until an update shows more messages of this step than those that a service
    // before it has sent. Without such a one nothing else is shown before.
    void awaitUpdate(long sentBefore);
    // The service streams for so long: updates alone, as often as they should come.
    void watchStream(Milliseconds time);
    // The service says nothing for so long: one update is still due, nothing more.
    void watchSilence(Milliseconds time);
    // Waits until an update shows so many messages of this step.
    void awaitDecoded(long messages);
    void expectDecoded(Range sent) const;

    // Before a service goes.
    void expectLoss() { _monitor.forgetErrors(); }
    // It has gone. Waits until "Connecting..." is shown; all that was sent in this step is decoded by then.
    void awaitLoss(Range sent);

    // There is no session. Waits for two starts that fail with the error: nothing is shown and decoded.
    void awaitRetries(const char* error);
    // The error was logged in this step.
    void expectError(const char* error) const;

private:
    void expectUpdate(const Status& status) const;
    std::string shown() const;

    MonitorProgram& _monitor;
    Milliseconds _slack;
    std::size_t _firstStatus = 0; // of this step
    long _decodedBefore = 0;
};

} // namespace orvex::soak
