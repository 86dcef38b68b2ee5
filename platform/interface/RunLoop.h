#pragma once

#include "Date.h"

#include <chrono>
#include <functional>
#include <memory>

namespace orvex {

// The main thread's event loop: a queue of tasks, delayed tasks and repeating timers.
class RunLoop {
public:
    using Task = std::function<void()>;

    // A running repeating timer. Destroying it stops it, even from inside its own task.
    class Timer {
    public:
        virtual ~Timer() = default;
    };

    virtual ~RunLoop() = default;

    // Runs the task in a later turn of the loop, in the order of the calls.
    virtual void post(Task task) = 0;
    // Runs the task once, no earlier than after the delay.
    virtual void postAfter(std::chrono::nanoseconds delay, Task task) = 0;
    // Runs the task once per period, the first time after one period.
    virtual std::unique_ptr<Timer> startTimer(std::chrono::nanoseconds period, Task task) = 0;
};

// The wall clock and the local time zone.
class Clock {
public:
    struct Zone {
        int secondsEastOfUTC = 0; // including daylight saving
        bool isDaylightSaving = false;
    };

    virtual ~Clock() = default;

    virtual Date now() const = 0;
    // The local zone as it applies at the given moment.
    virtual Zone zoneAt(Date moment) const = 0;
};

} // namespace orvex
