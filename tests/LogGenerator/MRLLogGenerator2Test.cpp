#include "MRLLogGenerator2.h"

#include "Base.h"
#include "GeneratorFixture.h"
#include "PacketText.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

// Shows the code and the length of the packet that it got.
class ProbeSection final : public Base {
public:
    ProbeSection(
        const char* name, std::vector<LogCode> codes, ClassDictionary& dict, CodeDictionary& codeDict)
        : Base(name, std::move(codes), dict, codeDict)
    {
    }
    void updateWithData(Packet packet, LogCode logCode) override
    {
        rows().setText("Packet", "%04X, %zu", static_cast<unsigned>(logCode), packet.size());
    }
};

class ProbeIndex final : public ClassIndex {
public:
    ProbeSection first{"First", {0x4116, kExtraCodeSimFiles}, _classDict, _codeDictionary};
    ProbeSection second{"Second", {0x4116}, _classDict, _codeDictionary};
};

class MRLLogGenerator2Test : public GeneratorFixture {
public:
    MRLLogGenerator2Test()
    {
        resources.templates["Probe"] = Dictionary::make({
            {"First", Dictionary::make({{"Packet", "-"}})},
            {"Group", Dictionary::make({{"Second", Dictionary::make()}, {"Text", "as it is"}})},
        });
        resources.templates["Other"] = Dictionary::make({{"Second", Dictionary::make()}});
    }

    std::unique_ptr<MRLLogGenerator2> makeGenerator(const char* name = "Probe") const
    {
        return std::make_unique<MRLLogGenerator2>(environment(), name, std::make_unique<ProbeIndex>());
    }
    // The display after a new generator took the message.
    std::string displayAfter(const char* name, const Bytes& message)
    {
        makeGenerator(name)->updateState(state, message);
        return display();
    }
};

TEST_F(MRLLogGenerator2Test, FramesRoutesAndKeepsMessages)
{
    const char* const nowhere = "First={Packet=-}, Group={Second={}, Text=as it is}";
    const struct {
        const char* message;
        std::string display;
        Lines lines = {};
    } cases[] = {
        {"01 00 00 16 41 00*7", nowhere}, // 12 bytes
        {"01 00 00 16 41 00*8", "First={Packet=4116, 13}, Group={Second={Packet=4116, 13}, Text=as it is}"},
        {"81 07 01 00 00 16 41 00*6",
            "First={Packet=4116, 11}, Group={Second={Packet=4116, 11}, Text=as it is}"},
        {"FF 00 00 00 00 00*8", "First={Packet=FF0000, 13}, Group={Second={}, Text=as it is}"},
        {"01 00 00 00 00 00*8", nowhere},
        {"00 00 00 16 41 00*8", nowhere, {"<3>Invalid log type: 0. Dropping."}},
        {"81 00 FE 00 00 16 41 00*6", nowhere, {"<3>Invalid log type: fe. Dropping."}},
    };
    for (const auto& [words, expected, lines] : cases) {
        clearState();
        const Bytes message = bytesOfWords(words);
        const auto generator = makeGenerator();
        generator->getDisplayFromState(state);
        RecordingLog log;
        generator->updateState(state, message);
        EXPECT_EQ(log.take(), lines) << words;
        EXPECT_EQ(display(), expected) << words;
        const Value answered = generator->generateLogUsingState(state);
        EXPECT_EQ(answered.dictionary(), state["Display"].dictionary());
        EXPECT_EQ(keptMessages(), message) << words << ": every message is kept as it came";
        generator->generateLogUsingState(state);
        EXPECT_TRUE(keptMessages().empty());
        EXPECT_EQ(state["History"].array()->size(), 2U);
    }
}

TEST_F(MRLLogGenerator2Test, BuildsTheDisplayOnceAndReturnsItFromTheSecondCallOn)
{
    const auto generator = makeGenerator("New");
    RecordingLog log;
    generator->updateState(state, packet(0x4116, Bytes()));
    EXPECT_TRUE(generator->generateLogUsingState(state).isNull());
    EXPECT_EQ(log.take(), Lines(2, "<3>Cannot load template for display"));
    resources.templates["New"] = resources.templates["Probe"]; // as every call tries again

    EXPECT_TRUE(generator->getDisplayFromState(state).isNull());
    EXPECT_THAT(log.take(),
        testing::ElementsAre(
            testing::MatchesRegex("<4>Initialized class index: 0x[0-9a-f]+, Self: 0x[0-9a-f]+"),
            "<4>Dictionary = 1", "<4>String = 0", "<4>First", "<4>Second"));
    const auto laidOut = generator->getDisplayFromState(state).dictionary();
    EXPECT_EQ(*laidOut, *resources.templates["Probe"]);
    EXPECT_NE(laidOut, resources.templates["Probe"]) << "sections must not write into the template";
    EXPECT_EQ(state["Template"].dictionary(), resources.templates["Probe"]);
    EXPECT_EQ(state["ExtraInfo"], Value(Dictionary::make()));
    EXPECT_EQ(*generator->getStartCommand(),
        Dictionary({{"SetState", "Streaming"}, {"SetMarlinLogCodes", Array::make({0x4116})},
            {"SetKoratExtraCodes", Array::make({0})}}));
}

TEST_F(MRLLogGenerator2Test, SectionIsBoundToTheEntryProcessedLast)
{
    const Bytes message = packet(0x4116, Bytes());
    resources.templates["Probe"] = Dictionary::make({
        {"Group", Dictionary::make({{"First", Dictionary::make()}})},
        {"First", Dictionary::make({{"First", Dictionary::make()}})}, // the inner one is processed before
        {"Second", Array::make()},                                    // rows have no place there
    });
    EXPECT_EQ(
        displayAfter("Probe", message), "Group={First={}}, First={First={}, Packet=4116, 13}, Second=[]");
}

TEST_F(MRLLogGenerator2Test, TemplateWithAnotherKindOfValueIsFatal)
{
    for (const Value& value : {Value(Dictionary::make({{"x", 1}})), Value(Array::make({1})), Value(true)}) {
        resources.templates["Probe"] = Dictionary::make({{"Group", value}});
        RecordingLog log;
        EXPECT_THROW(makeGenerator()->getDisplayFromState(state), InvalidTemplateException);
        EXPECT_THAT(log.take(),
            testing::IsSupersetOf({"<3>Received an object of unknown type", "<4>Processing the template"}));
        clearState();
    }
}

TEST_F(MRLLogGenerator2Test, TemplateEntryUnderAnotherKeyThanATextIsReported)
{
    const auto group = (*resources.templates["Probe"])["Group"].dictionary();
    group->leaveOutOne();
    const auto generator = makeGenerator();
    RecordingLog log;
    generator->getDisplayFromState(state);
    EXPECT_THAT(log.take(), testing::Contains("<3>Dictionary Key is not a string?"));
    EXPECT_EQ(display(), "First={Packet=-}, Group={Second={}, Text=as it is}");
}

TEST_F(MRLLogGenerator2Test, SuccessorsFindSectionsInsideAnArrayOfContainers)
{
    resources.templates["Listed"] = Dictionary::make({{"Groups",
        Array::make({Dictionary::make({{"First", Dictionary::make()}}),
            Dictionary::make({{"Second", Dictionary::make()}})})}});
    for (const auto& [payload, shown] : {std::pair(0U, "13"), {2U, "15"}}) {
        EXPECT_EQ(displayAfter("Listed", packet(0x4116, Bytes(payload))),
            text("Groups=[First={Packet=4116, %s} | Second={Packet=4116, %s}]", shown, shown));
    }
}

} // namespace
} // namespace orvex::test
