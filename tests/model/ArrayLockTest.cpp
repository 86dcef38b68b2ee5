#include "ArrayLock.h"

#include "Array.h"
#include "Base.h"
#include "NodesByPath.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <functional>
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

TEST(ArrayLock, IsTakenByWhoeverWalksOrChangesAPublishedArray)
{
    const auto array = Array::make({"old"});
    const std::pair<const char*, std::function<void()>> users[] = {
        {"tree builder",
            [&array] {
                NodesByPath nodes;
                OrvexModelNode::makeTreeFromObject(array, nodes);
            }},
        {"clear", [&array] { Base::clearElementsInArray(array); }},
        {"fill", [&array] { RowList(array).append(DeferredText("filled")); }},
        {"replace", [&array] { Base::replaceArray(array, Array({"new"})); }},
    };
    for (const auto& [name, use] : users) {
        ArrayLock::lockArray();
        auto used = std::async(std::launch::async, use);
        EXPECT_EQ(used.wait_for(std::chrono::milliseconds(50)), std::future_status::timeout) << name;
        ArrayLock::unlockArray();
        EXPECT_EQ(used.wait_for(std::chrono::seconds(10)), std::future_status::ready) << name;
    }
    EXPECT_EQ(*array, Array({"new"}));
}

} // namespace
} // namespace orvex::test
