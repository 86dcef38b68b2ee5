#pragma once

#include "RunLoop.h"

#include <algorithm>
#include <deque>
#include <vector>

namespace orvex::test {

// A run loop whose clock moves only when the test advances it.
class ManualRunLoop final : public RunLoop {
public:
    void post(Task task) override { _posted.push_back(std::move(task)); }
    void postAfter(std::chrono::nanoseconds delay, Task task) override
    {
        _waiting.push_back({nullptr, _now + delay, {}, std::move(task)});
    }
    std::unique_ptr<Timer> startTimer(std::chrono::nanoseconds period, Task task) override
    {
        auto timer = std::make_unique<ManualTimer>(*this);
        _waiting.push_back({timer.get(), _now + period, period, std::move(task)});
        return timer;
    }

    // Runs what was posted, and what those tasks post.
    void runPosted()
    {
        while (!_posted.empty()) {
            const Task task = std::move(_posted.front());
            _posted.pop_front();
            task();
        }
    }

    // Advances the clock and runs everything that comes due, in order.
    void advance(std::chrono::nanoseconds duration)
    {
        const auto end = _now + duration;
        for (;;) {
            runPosted();
            const auto next = std::ranges::min_element(_waiting, {}, &Waiting::due);
            if (next == _waiting.end() || next->due > end)
                break;
            _now = next->due;
            const Task task = next->task; // which may destroy its timer
            if (next->timer)
                next->due += next->period;
            else
                _waiting.erase(next);
            task();
        }
        _now = end;
    }

    std::size_t timerCount() const { return _waiting.size() - delayedCount(); }
    std::size_t delayedCount() const
    {
        return static_cast<std::size_t>(std::ranges::count(_waiting, nullptr, &Waiting::timer));
    }

private:
    struct ManualTimer final : Timer {
        explicit ManualTimer(ManualRunLoop& loop)
            : _loop(loop)
        {
        }
        ~ManualTimer() override
        {
            std::erase_if(_loop._waiting, [this](auto& each) { return each.timer == this; });
        }
        ManualTimer(const ManualTimer&) = delete;
        ManualTimer& operator=(const ManualTimer&) = delete;

        ManualRunLoop& _loop;
    };
    struct Waiting {
        const Timer* timer; // null for what comes once
        std::chrono::nanoseconds due;
        std::chrono::nanoseconds period;
        Task task;
    };

    std::chrono::nanoseconds _now{0};
    std::deque<Task> _posted;
    std::vector<Waiting> _waiting;
};

} // namespace orvex::test
