#include "Streamer.h"

#include "Array.h"
#include "TelephonyConstants.h"

#include <algorithm>
#include <utility>

namespace orvex::korat {

namespace {
using namespace std::chrono_literals;

constexpr std::int64_t kLargestCode = 0xFFFF;

constexpr auto kTick = 10ms;
constexpr auto kLiveTick = 100ms; // a modem changes slowly, and every tick wakes a handset
// The run loop has other work; what a tick does not manage is left to the next.
constexpr auto kLongestTick = 20ms;
constexpr std::size_t kLargestBacklog = std::size_t{4} << 20; // bytes
// After a stop of the whole process nobody wants the past in one burst.
constexpr auto kLongestCatchUp = 1s;

double seconds(std::chrono::duration<double> duration)
{
    return duration.count();
}
} // namespace

Subscription::Subscription(const Dictionary& startCommand)
    : _wantsEverything(!startCommand.contains(telephony::kSetMarlinLogCodes)
        && !startCommand.contains(telephony::kSetKoratExtraCodes))
{
    const auto add = [&](const char* key, LogCode base) {
        const ArrayRef codes = startCommand[key].array();
        if (!codes)
            return;
        for (const Value& code : *codes) {
            if (const auto* number = code.integer(); number && *number >= 0 && *number <= kLargestCode)
                _codes.insert(base + static_cast<LogCode>(*number));
        }
    };
    add(telephony::kSetMarlinLogCodes, 0);
    add(telephony::kSetKoratExtraCodes, kExtraCodeBase);
}

bool Subscription::isStartCommand(const Dictionary& command)
{
    return command[telephony::kSetState] == Value(telephony::kStreaming);
}

Streamer::Streamer(RunLoop& runLoop, std::shared_ptr<RemotePort> client, std::unique_ptr<Source> source,
    Subscription subscription, GarbageSource garbage, Pace pace, Listener listener)
    : _client(std::move(client))
    , _source(std::move(source))
    , _subscription(std::move(subscription))
    , _garbage(garbage)
    , _pace(pace)
    , _listener(std::move(listener))
    , _lastTick(SteadyClock::now())
{
    _timer = runLoop.startTimer(_source->isLive() ? kLiveTick : kTick, [this] { tick(); });
}

void Streamer::tick()
{
    const auto now = SteadyClock::now();
    const auto passed = std::min<SteadyClock::duration>(now - _lastTick, kLongestCatchUp);
    _lastTick = now;
    if (_client->pendingBytes() > kLargestBacklog)
        return;
    _elapsed += std::chrono::duration_cast<Microseconds>(passed);
    const double rate = _pace.rate.value_or(0);
    _allowance = std::min(_allowance + rate * seconds(passed), 1 + rate * seconds(kLongestCatchUp));

    const auto deadline = now + kLongestTick;
    while (SteadyClock::now() < deadline && _client->pendingBytes() <= kLargestBacklog) {
        if (_pace.count && _sent >= *_pace.count) {
            _timer.reset();
            return;
        }
        if (!_next)
            findNext(deadline);
        if (!_next || !isDue() || !sendNext())
            return;
    }
}

bool Streamer::isDue() const
{
    return _pace.rate ? _allowance >= 1 : _next->due <= _elapsed;
}

void Streamer::findNext(SteadyClock::time_point deadline)
{
    while (SteadyClock::now() < deadline) {
        auto message = _source->next(_elapsed);
        if (!message) {
            if (_source->isLive())
                return;
            if (goOnAfterTheEnd())
                continue;
            _timer.reset();
            return;
        }
        if (_subscription.wants(message->code)) {
            _garbage.spoil(*message);
            _next = std::move(message);
            _foundSomething = true;
            return;
        }
    }
}

bool Streamer::goOnAfterTheEnd()
{
    // Where nothing was wanted once, nothing ever will be, however often it comes by.
    return std::exchange(_foundSomething, false) && _source->restart();
}

bool Streamer::sendNext()
{
    // A message that the port does not take now stays the next one.
    if (_client->send(telephony::kLogChannelMessageId, _next->bytes, 0ms) != RemotePort::Status::success)
        return false;
    if (_listener)
        _listener(*_next);
    _next.reset();
    _allowance -= 1;
    ++_sent;
    return true;
}

} // namespace orvex::korat
