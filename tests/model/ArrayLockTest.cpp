#include "ArrayLock.h"

#include "Array.h"
#include "GSM/MRL_GSMLogGenerator.h"
#include "MessageFrame.h"
#include "NodesByPath.h"
#include "PacketText.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <functional>
#include <future>
#include <thread>

namespace orvex::test {
namespace {

// True when another thread can take the lock, which it then releases.
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
    // In a separate process: a lock held twice stays held, and the thread that waits for it never ends.
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
    const std::pair<const char*, const char*> sections[] = {
        {"GSM Set", "4005: 00 01 00*7"},            // a list filled in place
        {"BLER", "4116: 01 3492 07 01020304 FF*4"}, // a list in a row
        {"Detected Set", "417A: 0000 00"},          // a list emptied
        {"PDP Context Info", "FF0002: <array/>"},   // a list replaced
    };
    const auto expectLocking = [](const std::string& name, const std::function<void()>& use) {
        ArrayLock::lockArray();
        auto used = std::async(std::launch::async, use);
        EXPECT_EQ(used.wait_for(std::chrono::milliseconds(50)), std::future_status::timeout) << name;
        ArrayLock::unlockArray();
        EXPECT_EQ(used.wait_for(std::chrono::seconds(10)), std::future_status::ready) << name;
    };
    const MRL_GSMClassIndex index;
    const auto array = Array::make({"old"});
    expectLocking("tree builder", [&array] {
        NodesByPath nodes;
        OrvexModelNode::makeTreeFromObject(array, nodes);
    });
    for (const auto& [name, words] : sections) {
        Base& section = *index.getClass(name);
        const bool isInRow = std::string_view(name) == "BLER";
        const Value container = isInRow ? Value(Dictionary::make()) : Value(array);
        section.updateSectionRef(container);
        const Bytes packet = packetOfText(words);
        expectLocking(name, [&] { section.updateWithData(packet, MessageFrame(packet).logCode()); });
    }
}

} // namespace
} // namespace orvex::test
