#include "LogGenerator.h"
#include "GSM/MRL_GSMLogGenerator.h"
#include "LTE/LTELogGenerator.h"

#include "GeneratorFixture.h"
#include "SectionCases.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

class LogGeneratorTest : public GeneratorFixture { };

TEST_F(LogGeneratorTest, EachTechnologyHasItsGenerator)
{
    resources.templates["MRL_UTRAN2"] = Dictionary::make();
    const std::pair<const char*, int> firstCodes[] = {
        {"IFX", 0}, {"MRL_GSM", 0x417A}, {"MRL_CDMA", 0x108A}, {"MRL_LTE", 0xB0C2}, {"MRL_UTRAN2", 0xD0E0}};
    const QuietConsole quiet;
    for (const auto& [technology, firstCode] : firstCodes) {
        const auto generator = LogGenerator::generatorFromTechnology(technology, environment());
        ASSERT_NE(generator, nullptr) << technology;
        const auto codes = (*generator->getStartCommand())["SetMarlinLogCodes"].array();
        EXPECT_EQ(codes ? (*codes)[0] : Value(0), Value(firstCode)) << technology;
    }
    EXPECT_EQ(std::size(telephony::kTechnologies), std::size(firstCodes));
    for (const Value& unknown :
        {Value("MRL_LTE "), Value("mrl_lte"), Value("MRL_UTRAN"), Value(""), Value(), Value(1)})
        EXPECT_EQ(LogGenerator::generatorFromTechnology(unknown, environment()), nullptr);
}

// Every line that a generator logs, from its creation to its destruction.
template <typename Generator, typename Index>
void expectLines(const GeneratorEnvironment& environment, const std::string& name)
{
    using testing::StartsWith;
    RecordingLog log;
    std::string console;
    installConsole([&console](std::string_view line) { console += line; });
    Index();
    const std::size_t sections = log.take().size();
    console.clear();
    Generator::generator(environment);
    installConsole({});
    std::vector<testing::Matcher<std::string>> expected(sections, StartsWith("<4>Array Count: "));
    expected.insert(expected.begin(), "<3>Creating " + name + " object");
    expected.insert(expected.end(),
        {StartsWith("<3>Creating MRLLogGenerator2 object with 0x"), StartsWith("<4>Creating Log object: 0x"),
            "<3>Class Index: 1", StartsWith("<4>" + name + " is destructed 0x"),
            StartsWith("<4>MRL_GSMLogGenerator is destructed 0x")});
    EXPECT_THAT(log.take(), testing::ElementsAreArray(expected));
    EXPECT_THAT(console, testing::MatchesRegex("Deallocing (LTE|MRL_GSM)ClassIndexDeallocing ClassIndex"));
}

TEST_F(LogGeneratorTest, MarlinGeneratorsLogTheirCreationAndDestruction)
{
    expectLines<LTELogGenerator, LTEClassIndex>(environment(), "LTELogGenerator");
    expectLines<MRL_GSMLogGenerator, MRL_GSMClassIndex>(environment(), "MRL_GSMLogGenerator");
}

TEST_F(LogGeneratorTest, HistoryKeepsTheNewestFive)
{
    for (const auto& [before, oldest] : {std::pair(4, 0), {5, 1}, {7, 3}}) {
        const auto history = Array::make();
        for (int i = 0; i < before; ++i)
            history->append(i);
        Dictionary from{{"History", history}};
        LogGenerator::updateHistoryInState(from, clock);
        ASSERT_EQ(history->size(), 5U) << before;
        EXPECT_EQ((*history)[0], Value(oldest)) << before;
        EXPECT_NE((*history)[4].dictionary(), nullptr) << before;
    }
}

TEST_F(LogGeneratorTest, HistoryEntryIsAShallowCopyUpToTheFirstAbsentValue)
{
    const std::pair<const char*, const char*> cases[] = {
        {"",
            "DisplayState=(data), Display={Section={Row=new}}, ExtraInfo={}, Date=2023-11-14 22:13:20 +0000, "
            "Description=Snapshot (2023-11-14 22:13:20 +0000)"},
        {"DisplayState", ""},
        {"ExtraInfo", "DisplayState=(data), Display={Section={Row=new}}"},
    };
    for (const auto& [absent, expected] : cases) {
        const auto section = Dictionary::make({{"Row", "old"}});
        const auto laidOut = Dictionary::make({{"Section", section}});
        Dictionary from{{"DisplayState", std::make_shared<Bytes>()}, {"Display", laidOut},
            {"ExtraInfo", Dictionary::make()}};
        from.remove(absent);
        LogGenerator::updateHistoryInState(from, clock);
        // Nested sections go on changing, the dictionary itself does not.
        section->set("Row", "new");
        laidOut->set("Other", "later");
        EXPECT_EQ(shown(*from["History"].array()), expected) << absent;
    }
}

} // namespace
} // namespace orvex::test
