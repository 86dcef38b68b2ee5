#include "service/GarbageSource.h"
#include "service/Subscription.h"

#include "scenarios/ScenarioTable.h"

#include "Decoding.h"

#include <gtest/gtest.h>

#include <set>

namespace orvex::korat {
namespace {

TEST(Subscription, TakesTheCodesThatTheCommandNames)
{
    const LogCode sample[] = {0xB179, 0xB17F, 0xFF0000, 0xFF0002};
    const struct {
        const char* name;
        DictionaryRef command;
        std::set<LogCode> wanted; // of the sample
    } cases[] = {
        {"no lists: everything", Dictionary::make({{"SetState", "Streaming"}}),
            {std::begin(sample), std::end(sample)}},
        {"both lists",
            Dictionary::make(
                {{"SetMarlinLogCodes", Array::make({0xB17F})}, {"SetKoratExtraCodes", Array::make({2})}}),
            {0xB17F, 0xFF0002}},
        {"one list: no extra packets",
            Dictionary::make({{"SetMarlinLogCodes", Array::make({0xB179, 0xB17F})}}), {0xB179, 0xB17F}},
        {"empty lists: nothing",
            Dictionary::make({{"SetMarlinLogCodes", Array::make()}, {"SetKoratExtraCodes", Array::make()}}),
            {}},
        {"no codes in the list",
            Dictionary::make({{"SetMarlinLogCodes", Array::make({"45433", 0xB179 + 0x10000, -1, 45433.0})}}),
            {}},
        {"no list at all", Dictionary::make({{"SetMarlinLogCodes", "all"}}), {}},
    };
    for (const auto& [name, command, wanted] : cases) {
        const Subscription subscription(*command);
        for (const LogCode code : sample)
            EXPECT_EQ(subscription.wants(code), wanted.contains(code)) << name << ": " << code;
    }
}

TEST(GarbageSource, NothingOfItIsFatalToAGenerator)
{
    for (const ScenarioEntry& entry : scenarioTable()) {
        GarbageSource garbage(100, 5);
        test::Decoding decoding(entry.technology);
        const auto scenario = entry.make({});
        int changed = 0;
        for (int i = 0; i < 20'000; ++i) {
            const LogMessage message = scenario->next().message;
            const Bytes spoilt = garbage.pass(message.bytes);
            changed += spoilt == message.bytes ? 0 : 1;
            ASSERT_NO_THROW(decoding.feed(spoilt)) << entry.technology << " message " << i;
        }
        // A random log type may be the true one.
        EXPECT_GT(changed, 19'900);
    }
}

TEST(GarbageSource, TakesItsShare)
{
    const Bytes message(20, 1);
    GarbageSource none(0, 1);
    GarbageSource quarter(25, 1);
    int changed = 0;
    for (int i = 0; i < 10'000; ++i) {
        ASSERT_EQ(none.pass(message), message);
        changed += quarter.pass(message) == message ? 0 : 1;
    }
    EXPECT_NEAR(changed, 2500, 200);
}

TEST(GarbageSource, KnowsWhatReceiversReadAsPropertyLists)
{
    const auto message = [](std::uint8_t type, std::uint8_t low, std::uint8_t high, std::size_t length) {
        Bytes bytes(length);
        bytes[0] = type;
        bytes[3] = low;
        bytes[4] = high;
        return bytes;
    };
    const auto prefixed = [](Bytes bytes) {
        bytes.insert(bytes.begin(), {0x81, 0});
        return bytes;
    };
    EXPECT_TRUE(isReadAsPropertyList(message(255, 2, 0, 13)));
    EXPECT_TRUE(isReadAsPropertyList(prefixed(message(255, 0, 0, 11))));
    EXPECT_FALSE(isReadAsPropertyList(message(255, 0, 0, 12)));
    EXPECT_FALSE(isReadAsPropertyList(prefixed(message(255, 0, 0, 10))));
    EXPECT_FALSE(isReadAsPropertyList(message(255, 3, 0, 40)));
    EXPECT_FALSE(isReadAsPropertyList(message(255, 1, 1, 40)));
    EXPECT_FALSE(isReadAsPropertyList(message(1, 0, 0, 40)));
}

} // namespace
} // namespace orvex::korat
