#include "ArrayLock.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <future>
#include <thread>

namespace orvex::test {
namespace {

// True when a thread of its own can take the lock; it gives it back.
bool isFree()
{
    std::promise<void> taken;
    auto waiting = taken.get_future();
    std::thread([&taken] {
        ArrayLock::lockArray();
        ArrayLock::unlockArray();
        taken.set_value();
    }).detach();
    return waiting.wait_for(std::chrono::milliseconds(200)) == std::future_status::ready;
}

TEST(ArrayLock, NestedHoldsAreUnlockedOnceAtTheLastUnlock)
{
    // In a process of its own: a lock held twice stays held, and the thread that waits for it never ends.
    const auto lockAndUnlock = [](int depth) {
        for (int i = 0; i < depth; ++i)
            ArrayLock::lockArray();
        for (int i = 0; i < depth; ++i)
            ArrayLock::unlockArray();
        std::_Exit(isFree() ? 10 : 20);
    };
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(lockAndUnlock(1), testing::ExitedWithCode(10), "");
    EXPECT_EXIT(lockAndUnlock(2), testing::ExitedWithCode(20), "");
}

} // namespace
} // namespace orvex::test
