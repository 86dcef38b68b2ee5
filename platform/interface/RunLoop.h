#pragma once

#include <chrono>
#include <functional>
#include <memory>

namespace orvex {

// The main thread's event loop: queue, delayed execution and repeating timers.
class RunLoop {
public:
    using Task = std::function<void()>;

    // A running repeating timer. Destroying it stops it, from inside its own task too.
    class Timer {
    public:
        virtual ~Timer() = default;
    };

    virtual ~RunLoop() = default;

    // Runs the task in a later turn of the loop, in the order of the calls.
    virtual void post(Task task) = 0;
    // Runs the task once, not before the delay is over.
    virtual void postAfter(std::chrono::nanoseconds delay, Task task) = 0;
    // Runs the task at every period, the first time after one period.
    virtual std::unique_ptr<Timer> startTimer(std::chrono::nanoseconds period, Task task) = 0;
};

} // namespace orvex
