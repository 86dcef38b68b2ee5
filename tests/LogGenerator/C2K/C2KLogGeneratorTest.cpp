#include "GeneratorFixture.h"
#include "PacketText.h"

#include "C2K/C2KLogGenerator.h"
#include "GSM/GSMLogGenerator.h"
#include "MRLLogGenerator2.h"

namespace orvex::test {
namespace {

class C2KLogGeneratorTest : public GeneratorFixture {
public:
    C2KLogGeneratorTest()
    {
        resources.templates["C2KTemplate"] = Dictionary::make({
            {"Identity", Dictionary::make({{"SID", "kSystemId"}, {"Revision", "kProtocolRevision"}})},
            {"Copies",
                Dictionary::make({{"_sorted", "_sorted"}, {"1;SID", "kSystemId"},
                    {"Deep", Dictionary::make({{"SID", "kSystemId"}, {"Mark", "_sorted"}})}, {"Number", 1},
                    {"List", Array::make({"kSystemId"})}})},
        });
        resources.templates["Other"] = Dictionary::make({{"Section", "text"}});
    }

    std::unique_ptr<C2KLogGenerator> makeGenerator() const
    {
        return std::make_unique<C2KLogGenerator>(environment());
    }
    // The display's section of that name.
    std::string identityShown() const
    {
        const auto sections = state["Display"].dictionary();
        return sections && sections->contains("Identity") ? shown(*(*sections)["Identity"].dictionary()) : "";
    }
};

// A system identity packet: system 258 of a network whose protocol revision this is.
Bytes identity(std::uint8_t revision)
{
    return packetOfText(text("134F: 02 @46 02000000 0201 @133 %02X @171", revision));
}

TEST_F(C2KLogGeneratorTest, ShowsAValueInEveryRowThatNamesItsKey)
{
    const auto generator = makeGenerator();
    RecordingLog log;
    const auto laidOut = generator->generateLogUsingState(state).dictionary();
    EXPECT_EQ(log.take(), Lines(4, "<4>Processing the template")) << "once a dictionary";
    EXPECT_EQ(identityShown(), "SID=, Revision=");
    EXPECT_EQ(state["ExtraInfo"], Value(Dictionary::make())) << "for counters";

    generator->updateState(state, identity(7));
    EXPECT_EQ(generator->generateLogUsingState(state).dictionary(), laidOut);
    EXPECT_EQ(display(),
        "Identity={SID=258, Revision=7}, "
        "Copies={_sorted=_sorted, 1;SID=258, Deep={SID=258, Mark=_sorted}}");
    EXPECT_EQ(log.take(), Lines{});
    EXPECT_EQ(*state["Template"].dictionary(), *resources.templates["C2KTemplate"]);
}

TEST_F(C2KLogGeneratorTest, FramesAndKeepsWhatReachesADecoder)
{
    const char* const decoded = "SID=258, Revision=7";
    const char* const untouched = "SID=, Revision=";
    const std::string body = " 00 00 4F 13 00*8 02 @46 02000000 0201 @133 07 @171";
    const struct {
        std::string message;
        const char* identity;
        std::string kept;
        Lines lines = {};
    } cases[] = {
        {"01" + body, decoded, "01" + body},
        {"02" + body, decoded, "02" + body, {"<3>Invalid log type: 2. Dropping."}}, // decoded all the same
        {"FF" + body, untouched, "", {"<3>Invalid log type: ff. Dropping."}},
        {"01 00 00 84 11 00*200", untouched, ""}, // another code
        {"01 00 00 83 11 00*7", untouched, ""},
        {"81 00 01 00 00 83 11 00*6", untouched, "01 00 00 83 11 00*6",
            {"<3>Log code 0x1183 is 11 bytes long but should be 50 bytes."}},
    };
    for (const auto& [message, shownIdentity, kept, lines] : cases) {
        const auto generator = makeGenerator();
        state.remove("Display");
        generator->generateLogUsingState(state);
        RecordingLog log;
        generator->updateState(state, bytesOfWords(message));
        EXPECT_EQ(log.take(), lines) << message;
        EXPECT_EQ(identityShown(), shownIdentity) << message;
        generator->generateLogUsingState(state);
        EXPECT_EQ(keptMessages(), bytesOfWords(kept)) << message;
        generator->generateLogUsingState(state);
        EXPECT_TRUE(keptMessages().empty()) << message;
    }
    EXPECT_EQ(state["History"].array()->size(), 5U);
}

TEST_F(C2KLogGeneratorTest, WithoutATemplateMessagesAreKept)
{
    resources.templates.clear();
    const auto generator = makeGenerator();
    RecordingLog log;
    generator->updateState(state, identity(7));
    EXPECT_TRUE(generator->generateLogUsingState(state).isNull());
    EXPECT_EQ(log.take(), Lines(2, "<3>Cannot load C2K template for display"));
    EXPECT_EQ(keptMessages(), identity(7));
    EXPECT_EQ(generator->templateError(state), "C2KTemplate.plist: missing");
}

TEST_F(C2KLogGeneratorTest, TechnologiesTakeTurnsOnOneState)
{
    const std::string list = "<plist version=\"1.0\"><dict><key>A</key><string>x</string></dict></plist>";
    // Each technology follows each other, and itself with the third in between.
    for (const char turn : std::string_view("CCICOIOCOICI")) {
        SCOPED_TRACE(turn);
        const auto before = state["Display"];
        if (turn == 'C') {
            const bool isNext = identityShown().starts_with("SID");
            makeGenerator()->updateState(state, identity(7));
            EXPECT_EQ(identityShown(), "SID=258, Revision=7");
            EXPECT_EQ(before.dictionary() == state["Display"].dictionary(), isNext) << "shared";
        } else if (turn == 'O') {
            MRLLogGenerator2(environment(), "Other", std::make_unique<ClassIndex>())
                .updateState(state, identity(7));
            EXPECT_EQ(display(), "Section=text");
        } else {
            GSMLogGenerator(environment()).updateState(state, Bytes(list.begin(), list.end()));
            EXPECT_EQ(display(), "A=x");
        }
    }
}

TEST_F(C2KLogGeneratorTest, DisplayThatNoGeneratorMadeIsShownAsItIs)
{
    for (const Value& foreign :
        {Value(Dictionary::make({{"Identity", Dictionary::make()}})), Value("text")}) {
        MRLLogGenerator2 other(environment(), "Other", std::make_unique<ClassIndex>());
        const std::unique_ptr<C2KLogGenerator> own = makeGenerator();
        for (LogGenerator* generator :
            {static_cast<LogGenerator*>(own.get()), static_cast<LogGenerator*>(&other)}) {
            clearState();
            state.set("Display", foreign);
            generator->updateState(state, identity(7));
            EXPECT_EQ(generator->generateLogUsingState(state), foreign);
            EXPECT_EQ(generator->templateError(state), "");
            EXPECT_TRUE(state["Template"].isNull() && state["ExtraInfo"].isNull());
        }
    }
    // A template that is there already makes a display like any other, known as one's own from then on.
    clearState();
    state.set("Template", Dictionary::make({{"Row", "kSystemId"}}));
    makeGenerator()->updateState(state, identity(7));
    EXPECT_EQ(display(), "Row=258");
    MRLLogGenerator2(environment(), "Other", std::make_unique<ClassIndex>()).updateState(state, identity(7));
    EXPECT_EQ(display(), "Section=text");
}

} // namespace
} // namespace orvex::test
