// The event loop, and the clock.

#include "QtRunLoop.h"

#include "Environment.h"
#include "EventLoop.h"

#include <gtest/gtest.h>

#include <thread>

namespace orvex {
namespace {

using namespace std::chrono_literals;
using test::turnFor;
using test::waitUntil;

TEST(QtRunLoop, RunsPostedTasksLaterAndInOrder)
{
    QtRunLoop loop;
    std::string order;
    loop.post([&] {
        order += 'a';
        loop.post([&] { order += 'd'; });
        waitUntil([&] { return order.size() == 4; }); // an event loop inside a task runs them too
        order += 'e';
    });
    loop.post([&] { order += 'b'; });
    std::thread([&] { loop.post([&] { order += 'c'; }); }).join();
    EXPECT_EQ(order, "");
    EXPECT_TRUE(waitUntil([&] { return order.size() == 5; }));
    EXPECT_EQ(order, "abcde");
}

TEST(QtRunLoop, DelaysAreNeverShortAndATaskThatRepostsItselfDoesNotHoldThemUp)
{
    QtRunLoop loop;
    int turns = 0;
    std::function<void()> again = [&] {
        ASSERT_LT(++turns, 1'000'000) << "the timer never had its turn";
        loop.post(again);
    };
    loop.post(again);
    for (const auto delay : {0ns, 1'000'001ns, 30'500'000ns}) {
        const auto start = std::chrono::steady_clock::now();
        std::chrono::nanoseconds elapsed(-1);
        loop.postAfter(delay, [&] { elapsed = std::chrono::steady_clock::now() - start; });
        ASSERT_TRUE(waitUntil([&] { return elapsed.count() >= 0; }));
        EXPECT_GE(elapsed, delay);
    }
}

TEST(QtRunLoop, TimerStopsWhenItsOwnTaskDestroysIt)
{
    QtRunLoop loop;
    int ticks = 0;
    std::unique_ptr<RunLoop::Timer> timer;
    timer = loop.startTimer(5ms, [&timer, &ticks, marker = std::string(100, 'x')] {
        if (++ticks == 3)
            timer.reset();
        EXPECT_EQ(marker, std::string(100, 'x')) << "captures outlive the timer";
    });
    EXPECT_TRUE(waitUntil([&] { return !timer; }));
    turnFor(40ms);
    EXPECT_EQ(ticks, 3);
}

TEST(QtRunLoop, TasksThatHaveNotRunDieWithTheLoop)
{
    const auto witness = std::make_shared<int>();
    int runs = 0;
    auto loop = std::make_unique<QtRunLoop>();
    loop->postAfter(100ms, [&runs, witness] { ++runs; });
    loop->post([&loop] { loop.reset(); });
    loop->post([&runs, witness] { ++runs; });
    turnFor(150ms);
    EXPECT_FALSE(loop);
    EXPECT_EQ(runs, 0);
    EXPECT_EQ(witness.use_count(), 1) << "a dropped task is destroyed";
}

TEST(SystemClock, ZoneIsThatOfTheMoment)
{
    // POSIX zone strings, which need no installed zones.
    const SystemClock clock;
    const auto zoneAt = [&clock](const char* zone, double moment) {
        test::setEnvironment("TZ", zone);
        const auto [seconds, isDaylightSaving] = clock.zoneAt({moment});
        return std::to_string(seconds) + (isDaylightSaving ? " in summer" : "");
    };
    const char* central = "CET-1CEST,M3.5.0,M10.5.0/3";
    EXPECT_EQ(zoneAt(central, 1774745999.9), "3600");         // 2026-03-29 00:59:59.9 UTC
    EXPECT_EQ(zoneAt(central, 1774746000), "7200 in summer"); // 01:00:00
    EXPECT_EQ(zoneAt("NST3:30NDT,M3.2.0,M11.1.0", 1794808471), "-12600");
    EXPECT_EQ(zoneAt("UTC0", -1e300), "0");
    EXPECT_NEAR(clock.now().secondsSince1970, static_cast<double>(std::time(nullptr)), 60);
}

} // namespace
} // namespace orvex
