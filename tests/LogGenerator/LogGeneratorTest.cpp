#include "LogGenerator.h"

#include "GeneratorFixture.h"

namespace orvex::test {
namespace {

class LogGeneratorTest : public GeneratorFixture { };

TEST_F(LogGeneratorTest, OtherTechnologiesHaveNoGenerator)
{
    for (const Value& unknown :
        {Value("MRL_LTE "), Value("mrl_lte"), Value("MRL_UTRAN"), Value(""), Value(), Value(1)})
        EXPECT_EQ(LogGenerator::generatorFromTechnology(unknown, environment()), nullptr);
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
