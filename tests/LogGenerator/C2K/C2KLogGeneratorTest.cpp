#include "C2KFixture.h"

#include "GSM/GSMLogGenerator.h"
#include "MRLLogGenerator2.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

// What every decoder asks of the length of its packets.
const struct {
    LogCode code;
    std::size_t minimumLength;
    const char* complaint; // after the length
} kLengths[] = {
    {0x108A, 23, "must be at least 23"},
    {0x1183, 50, "should be 50"},
    {0x1192, 241, "must be at least 241"},
    {0x119C, 17, "must be at least 17"},
    {0x119D, 17, "must be at least 17"},
    {0x127E, 1750, "must be at least 1750"},
    {0x12B6, 25, "must be at least 25"},
    {0x134F, 171, "must be at least 171"},
};

// A packet whose counts and sizes claim as much as they can, or little, so that walks go on to the end.
Bytes lyingPacket(LogCode code, std::size_t length, std::uint8_t filling)
{
    Bytes bytes = packet(code, Bytes(2000, filling));
    bytes.resize(length);
    return bytes;
}

TEST(C2KDecoders, RefuseShortPackets)
{
    C2KFixture fixture;
    for (const auto& [code, minimumLength, complaint] : kLengths) {
        for (std::size_t length = 13; length < minimumLength; ++length) {
            EXPECT_EQ(fixture.rowsAfter(lyingPacket(code, length, 0)), RowTexts{});
            EXPECT_EQ(fixture.log.take(),
                Lines{text("<3>Log code 0x%x is %zu bytes long but %s bytes.", static_cast<unsigned>(code),
                    length, complaint)});
        }
        fixture.feed(lyingPacket(code, minimumLength, 0));
        for (const std::string& line : fixture.log.take())
            EXPECT_THAT(line, testing::Not(testing::HasSubstr("bytes long"))) << minimumLength;
    }
}

// Under the address sanitizer no read may leave the packet, whatever its counts claim.
TEST(C2KDecoders, StayWithinThePacket)
{
    C2KFixture fixture;
    const Bytes nested = packetOf(0x119C,
        {subpacket(1, {8}, 5), subpacket(2, Bytes(10, 1)), subpacket(4, {}),
            subpacket(3, Bytes(60, 0xFF), 8)},
        255);
    for (std::size_t length = 0; length <= nested.size(); ++length) {
        fixture.clear();
        fixture.feed(Bytes(nested.begin(), nested.begin() + static_cast<std::ptrdiff_t>(length)));
        for (const auto& [code, minimumLength, complaint] : kLengths) {
            for (const auto filling : Bytes{0x01, 0x0B, 0xFF})
                fixture.feed(lyingPacket(code, minimumLength + length, filling));
        }
    }
    EXPECT_EQ(textOf(rowsOf(fixture.display), "k1xDeviceState"), "Traffic [8]")
        << "the walk went all the way";
}

class C2KLogGeneratorTest : public testing::Test {
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
    std::unique_ptr<LogGenerator> makeOther() const
    {
        return std::make_unique<MRLLogGenerator2>(environment(), "Other", std::make_unique<ClassIndex>());
    }
    GeneratorEnvironment environment() const { return {resources, clock, {}}; }

    RowTexts section(const char* name) const
    {
        const auto display = state["Display"].dictionary();
        return display ? rowsOf((*display)[name].dictionary()) : RowTexts();
    }

    FixedResources resources;
    FixedClock clock;
    Dictionary state;
};

// A system identity packet: system 258 of a network whose protocol revision this is.
Bytes identity(std::uint8_t revision)
{
    return packetWith(0x134F, 171, {{13, {2}}, {46, {2, 0, 0, 0, 0x02, 0x01}}, {133, {revision}}});
}

TEST_F(C2KLogGeneratorTest, ShowsAValueInEveryRowThatNamesItsKey)
{
    const auto generator = makeGenerator();
    RecordingLog log;
    const auto display = generator->generateLogUsingState(state).dictionary();
    EXPECT_EQ(log.take(), Lines(4, "<4>Processing the template")) << "once a dictionary";
    ASSERT_NE(display, nullptr) << "at once";
    EXPECT_EQ(section("Identity"), (RowTexts{{"SID", ""}, {"Revision", ""}}));
    EXPECT_EQ(state["ExtraInfo"], Value(Dictionary::make())) << "for counters";

    generator->updateState(state, identity(7));
    EXPECT_EQ(generator->generateLogUsingState(state).dictionary(), display);
    EXPECT_EQ(section("Identity"), (RowTexts{{"SID", "258"}, {"Revision", "7"}}));
    EXPECT_EQ(
        section("Copies"), (RowTexts{{"_sorted", "_sorted"}, {"1;SID", "258"}, {"Deep", "(dictionary)"}}));
    EXPECT_EQ(*(*(*display)["Copies"].dictionary())["Deep"].dictionary(),
        Dictionary({{"SID", "258"}, {"Mark", "_sorted"}}));
    EXPECT_EQ(log.take(), Lines{});
    EXPECT_EQ(*state["Template"].dictionary(), *resources.templates["C2KTemplate"]);
}

TEST(Publisher, EndsAtADamagedEntry)
{
    const auto first = Dictionary::make();
    const auto second = Dictionary::make();
    for (const Value& damaged : {Value("x"), Value(Dictionary::make({{"key", "row"}})),
             Value(Dictionary::make({{"key", 1}, {"dict", second}}))}) {
        const auto entry = [](const DictionaryRef& dict) {
            return Dictionary::make({{"key", "row"}, {"dict", dict}});
        };
        const auto lookup =
            Dictionary::make({{"k", Array::make({entry(first), damaged, entry(second)})}, {"text", "x"}});
        const Publisher publisher(lookup);
        publisher.publish("k", "value");
        publisher.publish("text", "value");
        publisher.publish("absent", "value");
        EXPECT_EQ(rowsOf(first), (RowTexts{{"row", "value"}}));
        EXPECT_TRUE(second->isEmpty());
    }
    Publisher(nullptr).publish("k", "value");
}

TEST_F(C2KLogGeneratorTest, FramesAndKeepsWhatReachesADecoder)
{
    const Bytes plain = identity(7);
    const auto typed = [&plain](std::uint8_t type) {
        Bytes bytes = plain;
        bytes[0] = type;
        return bytes;
    };
    Bytes prefixed = {0x81, 0};
    prefixed.insert(prefixed.end(), plain.begin(), plain.end());
    const Bytes tooShort = packet(0x1183, {});
    const Bytes prefixedHeader = {0x81, 0, 1, 0, 0, 0x83, 0x11, 0, 0, 0, 0, 0, 0};
    const struct {
        const char* name;
        Bytes message;
        const char* revision;
        Bytes kept;
        Lines lines;
    } cases[] = {
        {"plain", plain, "7", plain, {}},
        {"prefixed", prefixed, "7", plain, {}},
        {"type 2 is decoded all the same", typed(2), "7", typed(2), {"<3>Invalid log type: 2. Dropping."}},
        {"extra packet", typed(0xFF), "", {}, {"<3>Invalid log type: ff. Dropping."}},
        {"another code", packet(0x1184, Bytes(200)), "", {}, {}},
        {"12 bytes", Bytes(tooShort.begin(), tooShort.end() - 1), "", {}, {}},
        {"13 bytes are kept, though refused", tooShort, "", tooShort,
            {"<3>Log code 0x1183 is 13 bytes long but should be 50 bytes."}},
        {"13 bytes with the prefix", prefixedHeader, "",
            Bytes(prefixedHeader.begin() + 2, prefixedHeader.end()),
            {"<3>Log code 0x1183 is 11 bytes long but should be 50 bytes."}},
    };
    for (const auto& [name, message, revision, kept, lines] : cases) {
        const auto generator = makeGenerator();
        state.remove("Display");
        generator->generateLogUsingState(state);
        RecordingLog log;
        generator->updateState(state, message);
        EXPECT_EQ(log.take(), lines) << name;
        EXPECT_EQ(textOf(section("Identity"), "Revision"), revision) << name;
        generator->updateState(state, message);
        generator->generateLogUsingState(state);
        Bytes twice = kept;
        twice.insert(twice.end(), kept.begin(), kept.end());
        EXPECT_EQ(*state["DisplayState"].data(), twice) << name;
        const auto history = state["History"].array();
        const auto entry = (*history)[history->size() - 1].dictionary();
        EXPECT_EQ(*(*entry)["DisplayState"].data(), twice) << name;
        generator->generateLogUsingState(state);
        EXPECT_TRUE(state["DisplayState"].data()->empty()) << name;
    }
    EXPECT_EQ(state["History"].array()->size(), 5U);
}

TEST_F(C2KLogGeneratorTest, MissingTemplateIsTriedAgainAtEveryCall)
{
    const auto skeleton = resources.templates.extract("C2KTemplate").mapped();
    const auto generator = makeGenerator();
    RecordingLog log;
    generator->updateState(state, identity(7));
    EXPECT_TRUE(state.isEmpty());
    EXPECT_TRUE(generator->generateLogUsingState(state).isNull());
    EXPECT_EQ(log.take(), Lines(2, "<3>Cannot load C2K template for display"));
    EXPECT_EQ(*state["DisplayState"].data(), identity(7));
    Dictionary laidOut{{"Template", skeleton}};
    EXPECT_NE(C2KLogGenerator::getDisplayFromState(laidOut, resources), nullptr) << "that of the state";
    resources.templates["C2KTemplate"] = skeleton;
    generator->updateState(state, identity(8));
    EXPECT_EQ(textOf(section("Identity"), "Revision"), "8");
}

TEST_F(C2KLogGeneratorTest, SuccessorWritesIntoTheDisplayThatIsThere)
{
    makeGenerator()->updateState(state, identity(7));
    const auto display = state["Display"].dictionary();
    const auto successor = makeGenerator();
    EXPECT_EQ(successor->generateLogUsingState(state).dictionary(), display);
    successor->updateState(state, identity(8));
    EXPECT_EQ(state["Display"].dictionary(), display);
    EXPECT_EQ(textOf(section("Identity"), "Revision"), "8");
}

TEST_F(C2KLogGeneratorTest, TechnologiesTakeTurnsOnOneState)
{
    // Each follows each, and itself with the third in between.
    for (const char turn : std::string_view("CICOIOCOICI")) {
        SCOPED_TRACE(turn);
        const std::string list = "<plist version=\"1.0\"><dict><key>A</key><string>x</string></dict></plist>";
        if (turn == 'C') {
            makeGenerator()->updateState(state, identity(7));
            EXPECT_EQ(section("Identity"), (RowTexts{{"SID", "258"}, {"Revision", "7"}}));
        } else if (turn == 'O') {
            makeOther()->updateState(state, identity(7));
            EXPECT_EQ(rowsOf(state["Display"].dictionary()), (RowTexts{{"Section", "text"}}));
        } else {
            GSMLogGenerator(environment()).updateState(state, Bytes(list.begin(), list.end()));
            EXPECT_EQ(rowsOf(state["Display"].dictionary()), (RowTexts{{"A", "x"}}));
        }
    }
}

TEST_F(C2KLogGeneratorTest, StartCommandAsksForTheCodesOfTheDecoders)
{
    EXPECT_EQ(*makeGenerator()->getStartCommand(),
        Dictionary({{"SetState", "Streaming"},
            {"SetMarlinLogCodes", Array::make({4234, 4483, 4498, 4790, 4508, 4509, 4734, 4943})}}));
}

} // namespace
} // namespace orvex::test
