#include "MRLLogGenerator2.h"

#include "FixedClock.h"
#include "FixedResources.h"
#include "PacketText.h"
#include "RecordingLog.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

// Shows what reached it: the code, and how long the packet was.
class ProbeSection final : public Base {
public:
    ProbeSection(
        const char* name, std::vector<LogCode> codes, ClassDictionary& dict, CodeDictionary& codeDict)
        : Base(name, std::move(codes), dict, codeDict)
    {
    }
    void updateWithData(Packet packet, LogCode logCode) override
    {
        rows().print("Packet", "%d: %d bytes", logCode, static_cast<int>(packet.size()));
    }
};

class ProbeIndex final : public ClassIndex {
public:
    ProbeSection first{"First", {0x4116, kExtraCodeSimFiles}, _classDict, _codeDictionary};
    ProbeSection second{"Second", {0x4116}, _classDict, _codeDictionary};
};

class MRLLogGenerator2Test : public testing::Test {
public:
    MRLLogGenerator2Test()
    {
        resources.templates["Probe"] = Dictionary::make({
            {"First", Dictionary::make({{"Packet", "-"}})},
            {"Group", Dictionary::make({{"Second", Dictionary::make()}, {"Text", "as it is"}})},
            {"List", Array::make({"element"})},
        });
    }

    std::unique_ptr<MRLLogGenerator2> makeGenerator(const char* name = "Probe") const
    {
        return std::make_unique<MRLLogGenerator2>(
            GeneratorEnvironment{resources, clock, {}}, name, std::make_unique<ProbeIndex>());
    }

    std::string shown(const char* section) const
    {
        const auto display = state["Display"].dictionary();
        auto dictionary = (*display)[section].dictionary();
        if (!dictionary)
            dictionary = (*(*display)["Group"].dictionary())[section].dictionary();
        const std::string* text = (*dictionary)["Packet"].string();
        return text ? *text : "";
    }

    FixedResources resources;
    FixedClock clock;
    Dictionary state;
};

TEST_F(MRLLogGenerator2Test, FramesAndRoutesByTheHeader)
{
    const auto framed = [](Bytes head) {
        head.resize(13);
        return head;
    };
    const struct {
        const char* name;
        Bytes message;
        const char* first;
        const char* second;
        Lines lines;
    } cases[] = {
        {"12 bytes", Bytes{1, 0, 0, 0x16, 0x41, 0, 0, 0, 0, 0, 0, 0}, "-", "", {}},
        {"13 bytes", framed({1, 0, 0, 0x16, 0x41}), "16662: 13 bytes", "16662: 13 bytes", {}},
        {"prefixed", framed({0x81, 7, 1, 0, 0, 0x16, 0x41}), "16662: 11 bytes", "16662: 11 bytes", {}},
        {"extra", framed({255, 0, 0, 0, 0}), "16711680: 13 bytes", "", {}},
        {"extra with the code of a baseband packet", framed({255, 0, 0, 0x16, 0x41}), "-", "", {}},
        {"baseband with the code of an extra packet", framed({1, 0, 0, 0, 0}), "-", "", {}},
        {"type 0", framed({0, 0, 0, 0x16, 0x41}), "-", "", {"<3>Invalid log type: 0. Dropping."}},
        {"type 0xFE behind a prefix", framed({0x81, 0, 0xFE, 0, 0, 0x16, 0x41}), "-", "",
            {"<3>Invalid log type: fe. Dropping."}},
    };
    for (const auto& [name, message, first, second, lines] : cases) {
        Dictionary fresh;
        const auto generator = makeGenerator();
        generator->getDisplayFromState(fresh);
        RecordingLog log;
        generator->updateState(fresh, message);
        EXPECT_EQ(log.take(), lines) << name;
        state.set("Display", fresh["Display"]);
        EXPECT_EQ(shown("First"), first) << name;
        EXPECT_EQ(shown("Second"), second) << name;
        generator->generateLogUsingState(fresh);
        EXPECT_EQ(*fresh["DisplayState"].data(), message) << name << ": every message is kept as it came";
    }
}

TEST_F(MRLLogGenerator2Test, BuildsTheDisplayOnceAndAnswersItFromTheSecondCallOn)
{
    const auto generator = makeGenerator();
    EXPECT_TRUE(generator->getDisplayFromState(state).isNull());
    const auto display = state["Display"].dictionary();
    ASSERT_NE(display, nullptr);
    EXPECT_EQ(*display, *resources.templates["Probe"]);
    EXPECT_NE(display, resources.templates["Probe"]) << "sections must not write into the template";
    EXPECT_EQ(state["Template"].dictionary(), resources.templates["Probe"]);
    EXPECT_EQ(*state["ExtraInfo"].dictionary(), Dictionary());
    EXPECT_EQ(generator->getDisplayFromState(state).dictionary(), display);
}

TEST_F(MRLLogGenerator2Test, EachDisplayRequestTakesThePacketsSinceTheLast)
{
    const auto generator = makeGenerator();
    const Bytes message(20, 2);
    generator->updateState(state, message);
    generator->updateState(state, message);
    EXPECT_EQ(generator->generateLogUsingState(state).dictionary(), state["Display"].dictionary());
    EXPECT_EQ(state["DisplayState"].data()->size(), 40U);
    generator->generateLogUsingState(state);
    EXPECT_TRUE(state["DisplayState"].data()->empty());
    EXPECT_EQ(state["History"].array()->size(), 2U);
}

TEST_F(MRLLogGenerator2Test, SectionIsBoundToTheEntryProcessedLast)
{
    resources.templates["Probe"] = Dictionary::make({
        {"Group", Dictionary::make({{"First", Dictionary::make()}})},
        {"First", Dictionary::make({{"First", Dictionary::make()}})}, // the inner one is processed before
    });
    const auto generator = makeGenerator();
    generator->updateState(state, packet(0x4116, Bytes()));
    const auto display = state["Display"].dictionary();
    EXPECT_TRUE((*display)["First"].dictionary()->contains("Packet"));
    EXPECT_FALSE((*(*display)["First"].dictionary())["First"].dictionary()->contains("Packet"));
    EXPECT_TRUE((*(*display)["Group"].dictionary())["First"].dictionary()->isEmpty());
}

TEST_F(MRLLogGenerator2Test, EntryOfTheWrongKindDropsItsRows)
{
    resources.templates["Probe"] = Dictionary::make({{"First", Array::make()}, {"Second", "text"}});
    const auto generator = makeGenerator();
    generator->updateState(state, packet(0x4116, Bytes()));
    EXPECT_EQ(*state["Display"].dictionary(), *resources.templates["Probe"]);
}

TEST_F(MRLLogGenerator2Test, MissingTemplateIsTriedAgainAtEveryCall)
{
    const auto generator = makeGenerator("Other");
    RecordingLog log;
    generator->updateState(state, packet(0x4116, Bytes()));
    EXPECT_TRUE(generator->generateLogUsingState(state).isNull());
    EXPECT_EQ(
        log.take(), (Lines{"<3>Cannot load template for display", "<3>Cannot load template for display"}));
    EXPECT_TRUE(state["Display"].isNull());

    resources.templates["Other"] = Dictionary::make({{"First", Dictionary::make()}});
    generator->updateState(state, packet(0x4116, Bytes()));
    EXPECT_EQ(shown("First"), "16662: 13 bytes");
}

TEST_F(MRLLogGenerator2Test, TemplateWithAnotherKindOfValueIsFatal)
{
    for (const Value& value :
        {Value(1), Value(1.5), Value(true), Value(Date()), Value(std::make_shared<Bytes>())}) {
        for (const Value& holder : {Value(Dictionary::make({{"x", value}})), Value(Array::make({value}))}) {
            resources.templates["Probe"] = Dictionary::make({{"Group", holder}});
            Dictionary fresh;
            RecordingLog log;
            const auto generator = makeGenerator();
            log.take();
            EXPECT_THROW(generator->getDisplayFromState(fresh), InvalidTemplateException);
            EXPECT_THAT(log.take(),
                testing::IsSupersetOf(
                    {"<3>Received an object of unknown type", "<4>Processing the template"}));
        }
    }
}

TEST_F(MRLLogGenerator2Test, StartCommandAsksForTheCodesOfTheSections)
{
    EXPECT_EQ(*makeGenerator()->getStartCommand(),
        Dictionary({{"SetState", "Streaming"}, {"SetMarlinLogCodes", Array::make({0x4116})},
            {"SetKoratExtraCodes", Array::make({0})}}));
}

TEST_F(MRLLogGenerator2Test, SuccessorWritesIntoTheDisplayThatIsThere)
{
    makeGenerator()->updateState(state, packet(0x4116, Bytes()));
    const auto display = state["Display"].dictionary();
    const auto successor = makeGenerator();
    successor->updateState(state, packet(0x4116, {1, 2}));
    EXPECT_EQ(state["Display"].dictionary(), display);
    EXPECT_EQ(shown("First"), "16662: 15 bytes");
    EXPECT_EQ(shown("Second"), "16662: 15 bytes");
}

TEST_F(MRLLogGenerator2Test, SuccessorOfAnotherTechnologyLaysOutItsOwnDisplay)
{
    makeGenerator()->updateState(state, packet(0x4116, Bytes()));
    resources.templates["Other"] = Dictionary::make({{"Second", Dictionary::make()}});
    makeGenerator("Other")->updateState(state, packet(0x4116, Bytes()));
    EXPECT_FALSE(state["Display"].dictionary()->contains("First"));
    EXPECT_EQ(shown("Second"), "16662: 13 bytes");
}

TEST_F(MRLLogGenerator2Test, SuccessorWithoutItsTemplateLeavesTheDisplayToTheNext)
{
    makeGenerator()->updateState(state, packet(0x4116, Bytes()));
    const auto display = state["Display"].dictionary();
    EXPECT_TRUE(makeGenerator("Other")->generateLogUsingState(state).isNull());
    makeGenerator()->updateState(state, packet(0x4116, {1, 2}));
    EXPECT_EQ(state["Display"].dictionary(), display);
    EXPECT_EQ(shown("First"), "16662: 15 bytes");
}

TEST_F(MRLLogGenerator2Test, DisplayWithoutATemplateIsNotItsOwn)
{
    state.set("Display", Dictionary::make({{"Foreign", "x"}}));
    makeGenerator()->updateState(state, packet(0x4116, Bytes()));
    EXPECT_EQ(shown("First"), "16662: 13 bytes");
}

TEST_F(MRLLogGenerator2Test, TellsOfTheDisplayThatItBuilds)
{
    const auto generator = makeGenerator();
    RecordingLog log;
    generator->getDisplayFromState(state);
    EXPECT_THAT(log.take(),
        testing::ElementsAre(
            testing::MatchesRegex("<4>Initialized class index: 0x[0-9a-f]+, Self: 0x[0-9a-f]+"),
            "<4>Dictionary = 1", "<4>String = 0", "<4>First", "<4>Second"));
}

} // namespace
} // namespace orvex::test
