#include "LogGenerator.h"
#include "C2K/C2KLogGenerator.h"
#include "GSM/GSMLogGenerator.h"
#include "GSM/MRL_GSMLogGenerator.h"
#include "LTE/LTELogGenerator.h"
#include "UTRAN/UTRANLogGenerator.h"

#include "Array.h"
#include "Console.h"
#include "FixedClock.h"
#include "FixedResources.h"
#include "RecordingLog.h"
#include "TelephonyConstants.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

TEST(LogGenerator, ChoosesByTheTextOfTheTechnology)
{
    const FixedResources resources;
    const FixedClock clock;
    const GeneratorEnvironment environment{resources, clock, {}};
    const auto lte = LogGenerator::generatorFromTechnology(telephony::kTechnologyMRL_LTE, environment);
    EXPECT_NE(dynamic_cast<LTELogGenerator*>(lte.get()), nullptr);
    const auto gsm = LogGenerator::generatorFromTechnology(telephony::kTechnologyMRL_GSM, environment);
    EXPECT_NE(dynamic_cast<MRL_GSMLogGenerator*>(gsm.get()), nullptr);
    const auto utran = LogGenerator::generatorFromTechnology(telephony::kTechnologyMRL_UTRAN2, environment);
    EXPECT_NE(dynamic_cast<UTRANLogGenerator*>(utran.get()), nullptr);
    const auto c2k = LogGenerator::generatorFromTechnology(telephony::kTechnologyMRL_CDMA, environment);
    EXPECT_NE(dynamic_cast<C2KLogGenerator*>(c2k.get()), nullptr);
    const auto ifx = LogGenerator::generatorFromTechnology(telephony::kTechnologyIFX, environment);
    EXPECT_NE(dynamic_cast<GSMLogGenerator*>(ifx.get()), nullptr);
    for (const Value& unknown : {Value("MRL_LTE "), Value("mrl_lte"), Value(""), Value(), Value(1)})
        EXPECT_EQ(LogGenerator::generatorFromTechnology(unknown, environment), nullptr);
}

// What a generator with this many sections says from its birth to its end.
template <typename Generator>
void expectLife(const std::string& name, std::size_t sections, const std::string& indexName)
{
    using testing::StartsWith;
    const FixedResources resources;
    const FixedClock clock;
    RecordingLog log;
    std::vector<std::string> console;
    installConsole([&console](std::string_view line) { console.emplace_back(line); });
    Generator::generator({resources, clock, {}});
    installConsole({});

    std::vector<testing::Matcher<std::string>> expected(
        sections, testing::Matcher<std::string>(StartsWith("<4>Array Count: ")));
    expected.insert(expected.begin(), "<3>Creating " + name + " object");
    expected.insert(expected.end(),
        {StartsWith("<3>Creating MRLLogGenerator2 object with 0x"), StartsWith("<4>Creating Log object: 0x"),
            "<3>Class Index: 1", StartsWith("<4>" + name + " is destructed 0x"),
            StartsWith("<4>MRL_GSMLogGenerator is destructed 0x")});
    EXPECT_THAT(log.take(), testing::ElementsAreArray(expected));
    EXPECT_EQ(console, (std::vector<std::string>{"Deallocing " + indexName, "Deallocing ClassIndex"}));
}

TEST(MarlinGenerators, TellOfTheirBirthAndTheirEnd)
{
    expectLife<LTELogGenerator>("LTELogGenerator", 11, "LTEClassIndex");
    expectLife<MRL_GSMLogGenerator>("MRL_GSMLogGenerator", 26, "MRL_GSMClassIndex");
}

TEST(LogGenerator, HistoryKeepsTheNewestFive)
{
    for (const int before : {0, 4, 5, 7}) {
        const auto history = Array::make();
        for (int i = 0; i < before; ++i)
            history->append(i);
        Dictionary state{{"History", history}};
        LogGenerator::updateHistoryInState(state, FixedClock());
        const int kept = std::min(before, 4);
        ASSERT_EQ(history->size(), static_cast<std::size_t>(kept + 1)) << before;
        for (int i = 0; i < kept; ++i)
            EXPECT_EQ((*history)[static_cast<std::size_t>(i)], Value(before - kept + i)) << before;
        EXPECT_NE((*history)[static_cast<std::size_t>(kept)].dictionary(), nullptr);
    }
}

TEST(LogGenerator, HistoryEntryEndsAtTheFirstAbsentValue)
{
    const std::vector<const char*> keys = {"DisplayState", "Display", "ExtraInfo"};
    const struct {
        const char* absent;
        std::vector<std::string> entryKeys;
    } cases[] = {
        {"", {"DisplayState", "Display", "ExtraInfo", "Date", "Description"}},
        {"DisplayState", {}},
        {"Display", {"DisplayState"}},
        {"ExtraInfo", {"DisplayState", "Display"}},
    };
    for (const auto& [absent, entryKeys] : cases) {
        Dictionary state;
        for (const char* key : keys) {
            if (absent != std::string_view(key))
                state.set(key, Dictionary::make());
        }
        LogGenerator::updateHistoryInState(state, FixedClock());
        ASSERT_EQ(state["History"].array()->size(), 1U) << absent;
        std::vector<std::string> found;
        for (const auto& entry : *(*state["History"].array())[0].dictionary())
            found.push_back(entry.key);
        EXPECT_EQ(found, entryKeys) << absent;
    }
}

TEST(LogGenerator, HistoryEntryIsAShallowCopyWithItsDate)
{
    const auto section = Dictionary::make({{"Row", "old"}});
    const auto display = Dictionary::make({{"Section", section}});
    Dictionary state{{"DisplayState", std::make_shared<Bytes>(3)}, {"Display", display},
        {"ExtraInfo", Dictionary::make()}};
    LogGenerator::updateHistoryInState(state, FixedClock());
    section->set("Row", "new");
    display->set("Other", "later");
    state["DisplayState"].data()->push_back(1);

    const auto entry = (*state["History"].array())[0].dictionary();
    EXPECT_EQ((*entry)["Display"], Value(Dictionary::make({{"Section", Dictionary::make({{"Row", "new"}})}})))
        << "nested sections go on changing, the dictionary itself does not";
    EXPECT_EQ((*entry)["DisplayState"].data()->size(), 3U);
    EXPECT_EQ((*entry)["Date"], Value("2023-11-14 22:13:20 +0000"));
    EXPECT_EQ((*entry)["Description"], Value("Snapshot (2023-11-14 22:13:20 +0000)"));
}

} // namespace
} // namespace orvex::test
