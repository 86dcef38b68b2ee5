#include "QtRunLoop.h"

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
        waitUntil([&] { return order.size() == 4; }); // also by an event loop inside a task
        order += 'e';
    });
    loop.post([&] { order += 'b'; });
    std::thread([&] { loop.post([&] { order += 'c'; }); }).join();
    EXPECT_EQ(order, "");
    EXPECT_TRUE(waitUntil([&] { return order.size() == 5; }));
    EXPECT_EQ(order, "abcde");
}

TEST(QtRunLoop, DelaysAreNeverShortNorHeldUpByATaskThatAlwaysPostsItself)
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
    // The capture is looked at after the timer has gone: it must still be there.
    timer = loop.startTimer(5ms, [&timer, &ticks, marker = std::string(100, 'x')] {
        if (++ticks == 3)
            timer.reset();
        EXPECT_EQ(marker, std::string(100, 'x'));
    });
    EXPECT_TRUE(waitUntil([&] { return !timer; }));
    turnFor(40ms);
    EXPECT_EQ(ticks, 3);
}

TEST(QtRunLoop, TasksThatHaveNotRunDieWithTheLoop)
{
    const auto witness = std::make_shared<int>();
    int runs = 0;
    {
        QtRunLoop loop;
        loop.post([&runs, witness] { ++runs; });
        loop.postAfter(1ms, [&runs, witness] { ++runs; });
    }
    auto loop = std::make_unique<QtRunLoop>();
    loop->post([&loop] { loop.reset(); });
    loop->post([&runs, witness] { ++runs; });
    turnFor(50ms);
    EXPECT_FALSE(loop);
    EXPECT_EQ(runs, 0);
    EXPECT_EQ(witness.use_count(), 1) << "a dropped task is destroyed, not kept";
}

} // namespace
} // namespace orvex
