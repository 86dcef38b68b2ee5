#pragma once

#include "RunLoop.h"

#include <algorithm>
#include <deque>
#include <vector>

namespace orvex::test {

// A run loop whose time stands still until the test moves it.
class ManualRunLoop final : public RunLoop {
public:
    void post(Task task) override { _posted.push_back(std::move(task)); }
    void postAfter(std::chrono::nanoseconds delay, Task task) override
    {
        _delayed.push_back({_now + delay, std::move(task)});
    }
    std::unique_ptr<Timer> startTimer(std::chrono::nanoseconds period, Task task) override
    {
        auto timer = std::make_unique<ManualTimer>(*this);
        _timers.push_back({timer.get(), _now + period, period, std::move(task)});
        return timer;
    }

    // Runs what was posted, and what that posts.
    void runPosted()
    {
        while (!_posted.empty()) {
            const Task task = std::move(_posted.front());
            _posted.pop_front();
            task();
        }
    }

    // Moves time on, running everything that comes due, in its order.
    void advance(std::chrono::nanoseconds duration)
    {
        const auto end = _now + duration;
        runPosted();
        while (runNextDueBy(end))
            runPosted();
        _now = end;
    }

    std::size_t delayedCount() const { return _delayed.size(); }
    std::size_t timerCount() const { return _timers.size(); }

private:
    struct ManualTimer final : Timer {
        explicit ManualTimer(ManualRunLoop& loop)
            : _loop(loop)
        {
        }
        ~ManualTimer() override
        {
            std::erase_if(_loop._timers, [this](const Running& running) { return running.timer == this; });
        }
        ManualTimer(const ManualTimer&) = delete;
        ManualTimer& operator=(const ManualTimer&) = delete;

        ManualRunLoop& _loop;
    };
    struct Delayed {
        std::chrono::nanoseconds due;
        Task task;
    };
    struct Running {
        const Timer* timer;
        std::chrono::nanoseconds due;
        std::chrono::nanoseconds period;
        Task task;
    };

    bool runNextDueBy(std::chrono::nanoseconds end)
    {
        const auto delayed = std::ranges::min_element(_delayed, {}, &Delayed::due);
        const auto running = std::ranges::min_element(_timers, {}, &Running::due);
        const bool hasDelayed = delayed != _delayed.end() && delayed->due <= end;
        const bool hasRunning = running != _timers.end() && running->due <= end;
        if (hasDelayed && (!hasRunning || delayed->due <= running->due)) {
            const Task task = std::move(delayed->task);
            _now = delayed->due;
            _delayed.erase(delayed);
            task();
        } else if (hasRunning) {
            _now = running->due;
            running->due += running->period;
            const Task task = running->task; // the task may destroy its timer
            task();
        }
        return hasDelayed || hasRunning;
    }

    std::chrono::nanoseconds _now{0};
    std::deque<Task> _posted;
    std::vector<Delayed> _delayed;
    std::vector<Running> _timers;
};

} // namespace orvex::test
