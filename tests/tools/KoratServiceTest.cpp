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
        EXPECT_TRUE(subscription.wants(std::nullopt) && subscription.wantsAny({})) << name;
    }
}

TEST(GarbageSource, NothingOfItIsFatalToAGenerator)
{
    for (const ScenarioEntry& entry : scenarioTable()) {
        GarbageSource garbage(50, 5);
        test::Decoding decoding(entry.technology);
        const auto scenario = entry.make({});
        if (scenario->codes().empty())
            continue; // what is no property list is fatal to whoever expects one
        int changed = 0;
        for (int i = 0; i < 20'000; ++i) {
            const LogMessage message = scenario->next().message;
            const Bytes spoilt = garbage.pass(message.bytes);
            changed += spoilt == message.bytes ? 0 : 1;
            ASSERT_NO_THROW(decoding.feed(spoilt)) << entry.technology << " message " << i;
        }
        EXPECT_NEAR(changed, 10'000, 300);
    }
}

} // namespace
} // namespace orvex::korat
