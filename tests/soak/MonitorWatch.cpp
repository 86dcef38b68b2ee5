#include "MonitorWatch.h"

#include "Expectation.h"

#include "TextFormat.h"

#include <algorithm>

namespace orvex::soak {

namespace {
using namespace std::chrono_literals;
using Milliseconds = MonitorWatch::Milliseconds;

constexpr Milliseconds kRefresh = 2s;
constexpr Milliseconds kRetry = 5s;
constexpr Milliseconds kQuery = 1s; // that nobody answers
constexpr Milliseconds kRepaint = 300ms;
constexpr Milliseconds kStampPrecision = 1s;
constexpr Milliseconds kLongestBacklog = 60s;

constexpr const char* kConnecting = "Connecting...";
constexpr const char* kStartFailed = "Could not create the ports necessary";

double inSeconds(Milliseconds time)
{
    return static_cast<double>(time.count()) / 1000;
}

bool isConnecting(const Status& status)
{
    return status.text == kConnecting;
}
} // namespace

void MonitorWatch::awaitLaunch()
{
    expect(
        _monitor.waitUntil([this] { return !_monitor.statuses().empty() && isConnecting(_monitor.status()); },
            kRetry + _slack),
        "\"Connecting...\" after the launch", shown());
}

void MonitorWatch::beginStep()
{
    _monitor.forgetErrors();
    _firstStatus = _monitor.statuses().size();
    _decodedBefore = _monitor.status().decoded;
}

void MonitorWatch::awaitUpdate(long sentBefore)
{
    const auto longest = kRetry + kQuery + kRefresh + _slack;
    const auto isAwaited = [&] { return _monitor.status().isUpdate() && decodedInStep() > sentBefore; };
    expect(
        _monitor.waitUntil(isAwaited, longest), text("an update within %.1f s", inSeconds(longest)), shown());
    for (std::size_t i = _firstStatus; i < _monitor.statuses().size(); ++i) {
        const Status& status = _monitor.statuses()[i];
        if (sentBefore == 0 || !isConnecting(status))
            expectUpdate(status);
    }
}

void MonitorWatch::watchStream(Milliseconds time)
{
    const std::size_t first = _monitor.statuses().size();
    qint64 before = _monitor.now();
    const auto expectSoon = [&](qint64 at) {
        expect(at - before <= (kRefresh + _slack).count(),
            text("an update every %.1f s", inSeconds(kRefresh + _slack)),
            text("none for %.1f s", inSeconds(Milliseconds(at - before))));
        before = at;
    };
    _monitor.letRun(time);
    for (std::size_t i = first; i < _monitor.statuses().size(); ++i) {
        const Status& status = _monitor.statuses()[i];
        expectUpdate(status);
        expectSoon(status.at);
        expect(status.decoded > _monitor.statuses()[i - 1].decoded, "messages with every update", shown());
    }
    expectSoon(_monitor.now());
}

void MonitorWatch::watchSilence(Milliseconds time)
{
    const std::size_t first = _monitor.statuses().size();
    _monitor.letRun(time);
    expect(
        _monitor.statuses().size() <= first + 1, "one update at most while the service is silent", shown());
    expectUpdate(_monitor.status());
}

void MonitorWatch::awaitDecoded(long messages)
{
    expect(_monitor.waitUntil([&] { return decodedInStep() >= messages; }, kLongestBacklog + _slack),
        text("%ld messages decoded", messages), shown());
    expectUpdate(_monitor.status());
}

void MonitorWatch::awaitLoss(Range sent)
{
    const auto isShown = [this] { return isConnecting(_monitor.status()); };
    const auto isNoticed = [&] { return isShown() || !_monitor.errorsWith(kStartFailed).empty(); };
    expect(
        _monitor.waitUntil(isNoticed, kRefresh + _slack), "the loss is noticed by the next refresh", shown());
    // The window is drawn anew only when something has come since the last update.
    const bool mayStay = sent.contains(decodedInStep());
    if (!_monitor.waitUntil(isShown, mayStay ? kRepaint : _slack))
        expect(mayStay, "\"Connecting...\" and " + sent.text() + " messages decoded", shown());
    expectDecoded(sent);
}

void MonitorWatch::expectDecoded(Range sent) const
{
    expect(sent.contains(decodedInStep()), sent.text() + " messages decoded", shown());
}

void MonitorWatch::awaitRetries(const char* error)
{
    const auto longest = kRetry + 2 * kQuery + _slack;
    for (std::size_t times = 1; times <= 2; ++times) {
        expect(_monitor.waitUntil([&] { return _monitor.errorsWith(error).size() >= times; }, longest),
            text("the error \"%s\" within %.1f s", error, inSeconds(longest)), _monitor.lastWords());
    }
    const auto at = _monitor.errorsWith(error);
    expect(at[1] - at[0] >= (kRetry - kRepaint).count(), "five seconds between two starts",
        text("%.1f s", inSeconds(Milliseconds(at[1] - at[0]))));
    _monitor.letRun(kRepaint);
    expect(_monitor.statuses().size() == _firstStatus, "the same status as before", shown());
}

void MonitorWatch::expectError(const char* error) const
{
    expect(!_monitor.errorsWith(error).empty(), text("the error \"%s\"", error), _monitor.lastWords());
}

void MonitorWatch::expectUpdate(const Status& status) const
{
    expect(status.isUpdate(), "\"Updated ...\"", shown());
    const auto stamp = QDateTime::fromString(status.text, "'Updated' yyyy-MM-dd 'at' HH:mm:ss");
    const auto age = stamp.msecsTo(status.saidAt);
    expect(age >= 0 && age <= (kStampPrecision + _slack).count(),
        "an update of " + status.saidAt.toString(Qt::ISODate).toStdString(), status.text.toStdString());
}

std::string MonitorWatch::shown() const
{
    std::string result;
    for (std::size_t i = _firstStatus; i < _monitor.statuses().size(); ++i) {
        const Status& status = _monitor.statuses()[i];
        result += text("\n      %.1f s ago, %ld messages into the step: %s",
            inSeconds(Milliseconds(_monitor.now() - status.at)), status.decoded - _decodedBefore,
            status.text.toStdString().c_str());
    }
    return result.empty() ? "no other status than before the step" : "in this step" + result;
}

} // namespace orvex::soak
