#include "QtRunLoop.h"

#include <QPointer>
#include <QTimer>

#include <algorithm>
#include <limits>

namespace orvex {

namespace {
std::chrono::milliseconds roundedUp(std::chrono::nanoseconds time)
{
    using std::chrono::milliseconds;
    constexpr milliseconds kLongest(std::numeric_limits<int>::max()); // what a Qt timer can count
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
        const auto task = _task; // the task may destroy the timer, but not itself while it runs
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
    // An event posted while events are delivered is delivered in the same turn; a timer that is started then
    // is not.
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
                return; // a task ran an event loop of its own, which ran the rest
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

} // namespace orvex
