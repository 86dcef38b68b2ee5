#include "QtRunLoop.h"

#include <QPointer>
#include <QTimer>

#include <algorithm>
#include <cmath>
#include <ctime>
#include <limits>
#include <utility>

namespace orvex {

namespace {
std::chrono::milliseconds roundedUp(std::chrono::nanoseconds time)
{
    using std::chrono::milliseconds;
    constexpr milliseconds kLongest(std::numeric_limits<int>::max()); // the most a Qt timer takes
    return std::clamp(std::chrono::ceil<milliseconds>(time), milliseconds(0), kLongest);
}

class QtTimer final : public RunLoop::Timer, QObject {
public:
    QtTimer(std::chrono::milliseconds period, RunLoop::Task task)
        : _task(std::make_shared<const RunLoop::Task>(std::move(task)))
    {
        startTimer(std::max(period, std::chrono::milliseconds(1)), Qt::PreciseTimer);
    }

private:
    void timerEvent(QTimerEvent*) noexcept override
    {
        const auto task = _task; // survives a task that destroys its timer
        (*task)();
    }

    std::shared_ptr<const RunLoop::Task> _task;
};
} // namespace

QtRunLoop::QtRunLoop() = default;

QtRunLoop::~QtRunLoop() = default;

void QtRunLoop::post(Task task)
{
    const std::lock_guard lock(_mutex);
    _posted.push_back(std::move(task));
    if (std::exchange(_turnIsComing, true))
        return;
    // A posted event may be delivered in the current turn; a timer started by it fires in the next.
    QMetaObject::invokeMethod(
        &_context, [this] { QTimer::singleShot(0, &_context, [this]() noexcept { runTurn(); }); },
        Qt::QueuedConnection);
}

void QtRunLoop::runTurn()
{
    std::size_t count = 0;
    {
        const std::lock_guard lock(_mutex);
        _turnIsComing = false;
        count = _posted.size();
    }
    const QPointer<QObject> alive(&_context);
    while (count-- > 0 && alive) {
        Task task;
        {
            const std::lock_guard lock(_mutex);
            if (_posted.empty())
                return; // a task ran an event loop of its own, and that ran the rest
            task = std::move(_posted.front());
            _posted.pop_front();
        }
        task();
    }
}

void QtRunLoop::postAfter(std::chrono::nanoseconds delay, Task task)
{
    QTimer::singleShot(
        roundedUp(delay), Qt::PreciseTimer, &_context, [task = std::move(task)]() noexcept { task(); });
}

std::unique_ptr<RunLoop::Timer> QtRunLoop::startTimer(std::chrono::nanoseconds period, Task task)
{
    return std::make_unique<QtTimer>(roundedUp(period), std::move(task));
}

Date SystemClock::now() const
{
    const auto sinceEpoch = std::chrono::system_clock::now().time_since_epoch(); // 1970 UTC
    return {std::chrono::duration<double>(sinceEpoch).count()};
}

Clock::Zone SystemClock::zoneAt(Date moment) const
{
    // Well inside what localtime_r can represent.
    constexpr double kFarthest = 1e15;
    const double seconds = std::isnan(moment.secondsSince1970) ? 0 : std::floor(moment.secondsSince1970);
    const auto time = static_cast<std::time_t>(std::clamp(seconds, -kFarthest, kFarthest));
    std::tm local{};
    tzset(); // localtime_r need not read $TZ itself
    if (!localtime_r(&time, &local))
        return {};
    return {static_cast<int>(local.tm_gmtoff), local.tm_isdst > 0};
}

} // namespace orvex
