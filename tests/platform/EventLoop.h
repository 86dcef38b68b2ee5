#pragma once

#include <QCoreApplication>
#include <QElapsedTimer>

#include <chrono>
#include <thread>

namespace orvex::test {

// Runs the event loop until the condition holds; false if it does not within the time.
template <typename Condition>
bool waitUntil(Condition condition, std::chrono::milliseconds longest = std::chrono::seconds(10))
{
    QElapsedTimer elapsed;
    elapsed.start();
    while (!condition()) {
        if (elapsed.elapsed() > longest.count())
            return false;
        QCoreApplication::processEvents();
        std::this_thread::sleep_for(std::chrono::microseconds(100));
    }
    return true;
}

// Runs the event loop for a while, to see that nothing happens.
inline void turnFor(std::chrono::milliseconds time)
{
    waitUntil([] { return false; }, time);
}

} // namespace orvex::test
