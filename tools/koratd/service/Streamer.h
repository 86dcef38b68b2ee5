#pragma once

#include "GarbageSource.h"
#include "Subscription.h"

#include "scenarios/Scenario.h"

#include "MessagePort.h"
#include "RunLoop.h"

#include <optional>

namespace orvex::korat {

// Sends a scenario's messages to a client: those it wants, when they are due, or at a given rate. While the
// client is slow, the scenario stands still; nothing is dropped.
class Streamer {
public:
    struct Pace {
        std::optional<double> rate;         // messages per second
        std::optional<std::uint64_t> count; // messages in all
    };

    Streamer(RunLoop& runLoop, std::shared_ptr<RemotePort> client, std::unique_ptr<Scenario> scenario,
        Subscription subscription, GarbageSource garbage, Pace pace);

    // Messages sent so far.
    std::uint64_t sent() const { return _sent; }

private:
    using SteadyClock = std::chrono::steady_clock;

    void tick();
    bool isDue() const;
    bool sendNext();
    void findNext(SteadyClock::time_point deadline);

    std::shared_ptr<RemotePort> _client;
    std::unique_ptr<Scenario> _scenario;
    Subscription _subscription;
    GarbageSource _garbage;
    Pace _pace;

    SteadyClock::time_point _lastTick;
    Microseconds _elapsed{};             // on the scenario's clock
    double _allowance = 0;               // messages that the rate allows now
    std::optional<Scenario::Item> _next; // the next message that the client wants
    std::uint64_t _sent = 0;
    std::unique_ptr<RunLoop::Timer> _timer;
};

} // namespace orvex::korat
