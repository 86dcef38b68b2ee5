#pragma once

#include "Faults.h"

#include "Dictionary.h"
#include "MessagePort.h"
#include "RunLoop.h"

#include <functional>
#include <set>

namespace orvex::korat {

// What a client's start command asks for.
class Subscription {
public:
    // A command that names no codes at all asks for everything. Entries that are no codes are passed over.
    // Codes choose among packets only: messages without a code go to whoever streams.
    explicit Subscription(const Dictionary& startCommand);

    // Whether a command is one to start the stream.
    static bool isStartCommand(const Dictionary& command);

    bool wants(std::optional<LogCode> code) const
    {
        return !code || _wantsEverything || _codes.contains(*code);
    }

private:
    bool _wantsEverything;
    std::set<LogCode> _codes;
};

// Sends a source's messages to a client: those it wants, when they are due, or at a given rate. While the
// client is slow, the source stands still; nothing is dropped. After the end of the source the stream rests;
// a live source is asked again.
class Streamer {
public:
    struct Pace {
        std::optional<double> rate;         // messages per second
        std::optional<std::uint64_t> count; // messages in all
    };

    // Is told of every message that was sent.
    using Listener = std::function<void(const Message& message)>;

    Streamer(RunLoop& runLoop, std::shared_ptr<RemotePort> client, std::unique_ptr<Source> source,
        Subscription subscription, GarbageSource garbage, Pace pace, Listener listener = {});

    // Messages sent so far.
    std::uint64_t sent() const { return _sent; }

private:
    using SteadyClock = std::chrono::steady_clock;

    void tick();
    bool isDue() const;
    bool sendNext();
    void findNext(SteadyClock::time_point deadline);
    bool goOnAfterTheEnd();

    std::shared_ptr<RemotePort> _client;
    std::unique_ptr<Source> _source;
    Subscription _subscription;
    GarbageSource _garbage;
    Pace _pace;
    Listener _listener;

    SteadyClock::time_point _lastTick;
    Microseconds _elapsed{};      // on the source's clock
    double _allowance = 0;        // messages that the rate allows now
    std::optional<Message> _next; // the next message that the client wants
    bool _foundSomething = false; // since the source's first message
    std::uint64_t _sent = 0;
    std::unique_ptr<RunLoop::Timer> _timer;
};

} // namespace orvex::korat
