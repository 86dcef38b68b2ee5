#pragma once

#include "RunLoop.h"

#include <QObject>

#include <deque>
#include <mutex>

namespace orvex {

// The Qt event loop of the thread that creates the object. Times are precise to the millisecond, rounded up.
//
// Tasks run one turn of the loop at a time: a task posted by a task waits for the next turn, so timers and
// sockets are served in between however much is posted. The destructor drops the tasks that have not run.
// post() may be called from any thread, everything else from the loop's own.
//
// An exception that leaves a task ends the process.
class QtRunLoop final : public RunLoop {
public:
    QtRunLoop();
    ~QtRunLoop() override;
    QtRunLoop(const QtRunLoop&) = delete;
    QtRunLoop& operator=(const QtRunLoop&) = delete;

    void post(Task task) override;
    void postAfter(std::chrono::nanoseconds delay, Task task) override;
    // The timer does not depend on the run loop object, and goes on without it.
    std::unique_ptr<Timer> startTimer(std::chrono::nanoseconds period, Task task) override;

private:
    void runTurn();

    std::mutex _mutex;
    std::deque<Task> _posted;   // waiting for the next turn
    bool _turnIsComing = false; // runTurn() will be called
    QObject _context;           // lives in the loop's thread; calls into it end with it
};

// The system's clock, in the zone that $TZ or the system names.
class SystemClock final : public Clock {
public:
    Date now() const override;
    Zone zoneAt(Date moment) const override;
};

} // namespace orvex
