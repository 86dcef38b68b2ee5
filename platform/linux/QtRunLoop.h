#pragma once

#include "RunLoop.h"

#include <QObject>

#include <deque>
#include <mutex>

namespace orvex {

// The Qt event loop of the thread that makes the object. Times are precise to the millisecond, rounded up.
//
// Tasks run one turn of the loop at a time: what a task posts waits for the next turn, so that timers and
// sockets are served in between however much is posted. Tasks that have not run when the object dies are
// dropped. post() may be called from any thread, everything else from the loop's own.
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
    // The timer stands on its own: it goes on when the run loop object is gone.
    std::unique_ptr<Timer> startTimer(std::chrono::nanoseconds period, Task task) override;

private:
    void runTurn();

    std::mutex _mutex;
    std::deque<Task> _posted;   // waiting for the next turn
    bool _turnIsComing = false; // runTurn() will be called
    QObject _context;           // lives in the loop's thread; calls into it end with it
};

} // namespace orvex
