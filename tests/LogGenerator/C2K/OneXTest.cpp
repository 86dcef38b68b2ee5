// Decoders of 1x status, traffic frames and system identity.

#include "C2KFixture.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

Bytes systemState(std::uint8_t state)
{
    return subpacket(1, {state});
}

Bytes radio(std::uint8_t bandClass = 0)
{
    return subpacket(2, {bandClass, 2, 0x02, 0x01, 0x04, 0x03, 0xF6, 0x7F, 0x85, 0xFF});
}

// Of one pilot without fingers, whose strength these give.
Bytes onePilot(unsigned m, std::uint8_t g, std::uint8_t c, unsigned energy)
{
    const auto low = [](unsigned value) { return static_cast<std::uint8_t>(value); };
    const auto high = [](unsigned value) { return static_cast<std::uint8_t>(value >> 8); };
    return subpacket(3,
        {low(m), high(m), g, c, 1, 0, 0, 0, 7, 0, 0xEE, 0xEE, 0xEE, 0xEE, 0xEE, 0xEE, 0xEE, 0xEE, 0xEE, 0xEE,
            low(energy), high(energy)});
}

// As many pilots as the packet has room for, all with the same bytes.
Bytes manyPilots(std::uint8_t count, std::uint8_t fingers)
{
    Bytes body = {1, 0, 1, 9, count, fingers, 0xFF, 0xFF};
    body.resize(120, 0x10);
    return subpacket(3, body);
}

const Bytes kNoPilots = subpacket(3, {1, 0, 1, 9, 0, 0, 0, 0});
const Bytes kFingerInfo = subpacket(4, {});

Bytes statusPacket(std::uint8_t state, const Bytes& rf = radio(), const Bytes& activeSet = kNoPilots)
{
    return packetOf(0x119C, {systemState(state), rf, activeSet, kFingerInfo});
}

TEST(OneXStatus, ReadsEachFieldFromItsOwnBytes)
{
    C2KFixture fixture;
    EXPECT_EQ(fixture.rowsAfter(statusPacket(8, radio(1))),
        (RowTexts{{"k1xDeviceState", "Traffic [8]"}, {"k1xRx0BandClass", "1.8 to 2.0GHz PCS band [1]"},
            {"k1xRx0ChanNum", "258"}, {"k1xRxAGC0", "-66.59 dBm"},
            {"k1xRx1BandClass", "872 to 960MHz TACS band [2]"}, {"k1xRx1ChanNum", "772"},
            {"k1xRxAGC1", "-20.83 dBm"}, {"k1xTxAGC", "-12.30 dBm"}, {"k1xActiveSetInfo", "(dictionary)"}}));
    const auto idle = fixture.rowsAfter(statusPacket(6));
    for (const char* row : {"k1xRx1BandClass", "k1xRx1ChanNum", "k1xRxAGC1", "k1xTxAGC"})
        EXPECT_EQ(textOf(idle, row), "N/A");
    EXPECT_EQ(textOf(idle, "k1xRxAGC0"), "-66.59 dBm");
    EXPECT_EQ(fixture.log.take(), Lines{});
}

TEST(OneXStatus, NamesStatesAndBandClasses)
{
    const struct {
        std::uint8_t value;
        const char* state;
        const char* bandClass;
    } cases[] = {
        {0, "Inactive [0]", "800 MHz cellular band [0]"},
        {1, "Deep sleep in start state [1]", "1.8 to 2.0GHz PCS band [1]"},
        {2, "Initial state for CDMA operation [2]", "872 to 960MHz TACS band [2]"},
        {7, "Slotted mode sleep state [7]", "700MHz band [7]"},
        {8, "Traffic [8]", "1800 MHz band [8]"},
        {9, "UnSlew [9]", "900 MHzband [9]"},
        {10, "Operation in PCG state [10]", "Secondary 800 MHz band [10]"},
        {11, "Powerup state [11]", "400 MHz European PAMR band [11]"},
        {12, "[Bad Value 12]", "800 MHz European PAMR band [12]"},
        {255, "[Bad Value 255]", "[Bad Value 255]"},
    };
    C2KFixture fixture;
    for (const auto& [value, state, bandClass] : cases) {
        const auto rows = fixture.rowsAfter(statusPacket(value, radio(value)));
        EXPECT_EQ(textOf(rows, "k1xDeviceState"), state);
        EXPECT_EQ(textOf(rows, "k1xRx0BandClass"), bandClass);
    }
    for (std::uint8_t state = 0; state < 12; ++state)
        EXPECT_THAT(fixture.textAfter(statusPacket(state), "k1xDeviceState"),
            testing::MatchesRegex(text("[A-Z].*[a-z] \\[%d\\]", state)));
}

TEST(OneXStatus, NeedsItsFourSubpackets)
{
    const Bytes ss = systemState(8);
    const Bytes rf = radio();
    const struct {
        const char* name;
        std::vector<Bytes> subpackets;
        Lines lines;
    } cases[] = {
        {"in any order", {kFingerInfo, kNoPilots, subpacket(99, {1, 2}), rf, ss}, {}},
        {"none", {}, {"<4>Log code 0x119c: missing subpacket (ss=0,rf=0,ai=0,fi=0)."}},
        {"no state", {rf, kNoPilots, kFingerInfo},
            {"<4>Log code 0x119c: missing subpacket (ss=0,rf=1,ai=1,fi=1)."}},
        {"no radio", {ss, kNoPilots, kFingerInfo},
            {"<4>Log code 0x119c: missing subpacket (ss=1,rf=0,ai=1,fi=1)."}},
        {"no active set", {ss, rf, kFingerInfo},
            {"<4>Log code 0x119c: missing subpacket (ss=1,rf=1,ai=0,fi=1)."}},
        {"no fingers", {ss, rf, kNoPilots}, {"<4>Log code 0x119c: missing subpacket (ss=1,rf=1,ai=1,fi=0)."}},
    };
    C2KFixture fixture;
    for (const auto& [name, subpackets, lines] : cases) {
        EXPECT_EQ(fixture.rowsAfter(packetOf(0x119C, subpackets)).empty(), !lines.empty()) << name;
        EXPECT_EQ(fixture.log.take(), lines) << name;
    }
}

TEST(OneXStatus, ListsPilotsOfTheActiveSet)
{
    // Two pilots of one finger, 20 bytes apart; the reference PN is that of the second.
    Bytes body = {0x02, 0x01, 3, 9, 2, 1, 0x2C, 0x01};
    body.resize(46, 0xEE);
    const auto put = [&body](std::size_t offset, std::uint8_t low, std::uint8_t high) {
        body[offset - 4] = low;
        body[offset - 3] = high;
    };
    put(12, 0x04, 0x01);
    put(28, 0x04, 0x03);
    put(32, 0x2C, 0x01);
    put(48, 0x10, 0x00);
    C2KFixture fixture;
    EXPECT_EQ(fixture.listAfter(statusPacket(6, radio(), subpacket(3, body)), "k1xActiveSetInfo"),
        (RowTexts{{"_sorted", "_sorted"}, {"0;260", "+11.48 dB"}, {"1;300", "(ref pilot) -5.41 dB"}}));
    EXPECT_EQ(fixture.listAfter(statusPacket(6), "k1xActiveSetInfo"), (RowTexts{{"_sorted", "_sorted"}}));
}

TEST(OneXStatus, ComputesThePilotsStrength)
{
    const struct {
        const char* name;
        Bytes activeSet;
        const char* strength;
    } cases[] = {
        {"no more than noise", onePilot(1, 1, 0, 72), "-50.00 dB"},
        {"just more", onePilot(1, 1, 0, 73), "-18.57 dB"},
        {"no energy", onePilot(1, 1, 0, 0), "-50.00 dB"},
        {"scale", onePilot(1, 2, 2, 1000), "+20.42 dB"},
        {"m times m beyond 31 bits", onePilot(65535, 255, 20, 65535), "+29.61 dB"},
        {"highest scale", onePilot(1, 1, 255, 65535), "+1564.84 dB"},
        {"m of zero", onePilot(0, 1, 9, 1000), "-50.00 dB"},
        {"m and energy of zero", onePilot(0, 1, 9, 0), "-50.00 dB"},
        {"g of zero", onePilot(1, 0, 9, 1000), "+inf dB"},
    };
    C2KFixture fixture;
    for (const auto& [name, activeSet, strength] : cases)
        EXPECT_EQ(fixture.listAfter(statusPacket(6, radio(), activeSet), "k1xActiveSetInfo"),
            (RowTexts{{"_sorted", "_sorted"}, {"0;7", strength}}))
            << name;
}

TEST(OneXStatus, ShowsThePilotsThatFit)
{
    const struct {
        std::uint8_t count;
        std::uint8_t fingers;
        std::size_t end; // of the packet behind the start of the active set
        std::size_t pilots;
    } cases[] = {
        {255, 0, 26, 1}, // the energy of a pilot lies at 24, those of the next 12 bytes on
        {255, 0, 25, 0},
        {255, 0, 38, 2},
        {255, 0, 37, 1},
        {255, 2, 34, 1}, // at 32, and 24 bytes on
        {255, 2, 33, 0},
        {255, 2, 58, 2},
        {1, 0, 100, 1},
        {255, 255, 124, 0},
    };
    C2KFixture fixture;
    for (const auto& [count, fingers, end, pilots] : cases) {
        Bytes bytes = packetOf(0x119C, {systemState(6), radio(), kFingerInfo, manyPilots(count, fingers)});
        const std::size_t start = bytes.size() - 124;
        // The claimed size stays within the bound, whatever the packet holds.
        bytes[start + 2] = static_cast<std::uint8_t>(end);
        bytes.resize(start + end);
        EXPECT_EQ(fixture.listAfter(bytes, "k1xActiveSetInfo").size(), pilots + 1) << end;
    }
}

TEST(OneXStatus, FieldBehindThePacketLeavesItsRow)
{
    // The radio's subpacket comes last and loses its end; then the state's, which the radio rows depend on.
    const Bytes whole = packetOf(0x119C, {systemState(8), kNoPilots, kFingerInfo, radio()});
    const struct {
        std::size_t cut;
        std::vector<std::string> missing;
    } cases[] = {
        {0, {}},
        {1, {"k1xTxAGC"}},
        {3, {"k1xTxAGC", "k1xRxAGC1"}},
        {5, {"k1xTxAGC", "k1xRxAGC1", "k1xRxAGC0", "k1xRx1ChanNum"}},
        {10,
            {"k1xTxAGC", "k1xRxAGC1", "k1xRxAGC0", "k1xRx1ChanNum", "k1xRx0ChanNum", "k1xRx1BandClass",
                "k1xRx0BandClass"}},
    };
    C2KFixture fixture;
    for (const auto& [cut, missing] : cases) {
        const auto rows = fixture.rowsAfter(Bytes(whole.begin(), whole.end() - static_cast<long>(cut)));
        EXPECT_EQ(rows.size(), 9 - missing.size()) << cut;
        for (const std::string& row : missing)
            EXPECT_EQ(textOf(rows, row.c_str()), "(absent)") << cut;
    }
    Bytes noState = packetOf(0x119C, {radio(), kNoPilots, kFingerInfo, systemState(8)});
    noState.pop_back();
    fixture.state.set("TrafficFER", 0.5);
    EXPECT_EQ(fixture.rowsAfter(noState).size(), 4U) << "receiver 0 and active set";
    EXPECT_EQ(fixture.state["TrafficFER"], Value(0.5));
    Bytes noHead = packetOf(0x119C, {systemState(8), radio(), kFingerInfo, kNoPilots});
    noHead.pop_back();
    EXPECT_EQ(fixture.textAfter(noHead, "k1xActiveSetInfo"), "(absent)");
    EXPECT_EQ(fixture.log.take(), Lines{});
}

// Traffic frames whose demodulation subpacket has this error byte.
Bytes framePacket(std::uint8_t error)
{
    Bytes body(20, 0);
    body.push_back(error);
    return packetOf(0x119D, {subpacket(11, body)});
}

TEST(SubpacketWalk, FindsWithinItsBounds)
{
    const Bytes frame = framePacket(1);
    const auto changed = [&frame](std::size_t offset, unsigned value) {
        Bytes bytes = frame;
        bytes[offset] = static_cast<std::uint8_t>(value);
        bytes[offset + 1] = static_cast<std::uint8_t>(value >> 8);
        return bytes;
    };
    const Bytes body(21, 1);
    const char* missing = "<4>Log code 0x119d: missing traffic demod subpacket.";
    const auto length = static_cast<unsigned>(frame.size());
    const struct {
        const char* name;
        Bytes packet;
        bool isFound;
        Lines lines;
    } cases[] = {
        {"plain", frame, true, {}},
        {"size of zero", changed(19, 0), true, {}},
        {"ends one byte before the bound", changed(19, length - 1), true, {}},
        {"ends at the bound", changed(19, length), false,
            {text("<3>Log code error in subpkt#0: bad size (%u).", length), missing}},
        {"second ends behind the bound", packetOf(0x119D, {subpacket(5, {}), subpacket(11, body, 0xFFFF)}),
            false, {"<3>Log code error in subpkt#1: bad size (65535).", missing}},
        {"none counted", packetOf(0x119D, {subpacket(11, body)}, 0), false, {missing}},
        {"beyond the count", packetOf(0x119D, {subpacket(5, {}), subpacket(11, body)}, 1), false, {missing}},
        {"another with a size of zero", packetOf(0x119D, {subpacket(5, {}, 0), subpacket(11, body)}, 255),
            false, {missing}},
        {"no header behind the last", packetOf(0x119D, {subpacket(5, {})}, 255), false, {missing}},
        {"three bytes of header", packetOf(0x119D, {subpacket(5, {}), {11, 0, 4}}), false, {missing}},
        {"next one beyond the packet", packetOf(0x119D, {subpacket(5, {}, 10)}, 2), false, {missing}},
    };
    C2KFixture fixture;
    for (const auto& [name, packet, isFound, lines] : cases) {
        EXPECT_EQ(!fixture.rowsAfter(packet).empty(), isFound) << name;
        EXPECT_EQ(fixture.log.take(), lines) << name;
    }
    Bytes cut = frame;
    cut.pop_back();
    EXPECT_EQ(fixture.rowsAfter(cut), RowTexts{}) << "the error byte is behind the packet";
    EXPECT_EQ(fixture.log.take(), Lines{});
}

TEST(TrafficFER, AveragesInSinglePrecision)
{
    C2KFixture fixture;
    const char* row = "k1xTrafficFER";
    EXPECT_EQ(fixture.textAfter(framePacket(2), row), "1.56%");
    EXPECT_EQ(fixture.textAfter(framePacket(0), row), "1.54%");
    EXPECT_EQ(fixture.textAfter(statusPacket(8), row), "(absent)");
    EXPECT_EQ(fixture.textAfter(statusPacket(6), row), "1.54% (old)");
    EXPECT_EQ(fixture.textAfter(statusPacket(6), row), "(absent)") << "shown once";
    EXPECT_EQ(fixture.textAfter(framePacket(0), row), "0.00%") << "a new average";

    fixture.state.remove("TrafficFER");
    for (int frame = 0; frame < 60; ++frame)
        fixture.feed(framePacket(frame < 59 ? 1 : 0));
    EXPECT_EQ(fixture.textAfter(framePacket(0), row), "58.64%") << "58.63% in double precision";
    fixture.state.set("TrafficFER", static_cast<double>(0.00625F));
    EXPECT_EQ(fixture.textAfter(statusPacket(6), row), "0.62% (old)") << "0.63% in double precision";
}

Bytes identityPacket(std::size_t length, Bytes roaming = {1, 0, 0, 0}, std::uint8_t systemType = 2)
{
    return packetWith(0x134F, length,
        {{13, {2}}, {42, std::move(roaming)},
            {46, {systemType, 0, 0, systemType == 2 ? std::uint8_t{0} : std::uint8_t{0x80}}},
            {50, {0x02, 0x01}}, {52, {0x04, 0x03}}, {131, {200}}, {133, {7}}, {184, {0x06, 0x05}}});
}

TEST(OneXSystemIdentity, ReadsEachFieldFromItsOwnBytes)
{
    C2KFixture fixture;
    EXPECT_EQ(fixture.rowsAfter(identityPacket(186)),
        (RowTexts{{"k1xRoamingHome", "ON [1]"}, {"kSystemId", "258"}, {"kNetworkId", "772"},
            {"kPacketZoneId", "200"}, {"kBaseId", "1286"}, {"kProtocolRevision", "7"}}));
    const auto foreign = fixture.rowsAfter(identityPacket(186, {1, 0, 0, 0}, 3));
    EXPECT_EQ(textOf(foreign, "kSystemId"), "(unknown system type -2147483645)");
    EXPECT_EQ(textOf(foreign, "kNetworkId"), "(unknown system type -2147483645)");
    for (const std::size_t length : {171U, 184U, 185U})
        EXPECT_EQ(fixture.textAfter(identityPacket(length), "kBaseId"), "(absent)") << length;

    EXPECT_EQ(fixture.log.take(), Lines{});
    EXPECT_EQ(fixture.rowsAfter(packetWith(0x134F, 186, {{13, {1}}})), RowTexts{});
    EXPECT_EQ(fixture.log.take(),
        Lines{"<3>Log code 0x134f has version=1; only version 2 or higher expected; dropping."});
}

TEST(OneXSystemIdentity, NamesRoamingIndicators)
{
    const struct {
        Bytes value;
        const char* text;
    } cases[] = {
        {{0, 0, 0, 0}, "OFF [0]"},
        {{1, 0, 0, 0}, "ON [1]"},
        {{2, 0, 0, 0}, "Flashing [2]"},
        {{3, 0, 0, 0}, "Out of Neighborhood [3]"},
        {{4, 0, 0, 0}, "Out of Building [4]"},
        {{5, 0, 0, 0}, "Preferred system [5]"},
        {{6, 0, 0, 0}, "Available system [6]"},
        {{7, 0, 0, 0}, "Alliance partner [7]"},
        {{8, 0, 0, 0}, "Premium partner [8]"},
        {{9, 0, 0, 0}, "Full service functionality [9]"},
        {{10, 0, 0, 0}, "Partial service functionality [10]"},
        {{11, 0, 0, 0}, "Banner ON [11]"},
        {{12, 0, 0, 0}, "Banner OFF [12]"},
        {{13, 0, 0, 0}, "ERI - 13"},
        {{0, 1, 0, 0}, "ERI - 256"},
        {{0xFF, 0xFF, 0xFF, 0xFF}, "ERI - -1"},
    };
    C2KFixture fixture;
    for (const auto& [value, text] : cases)
        EXPECT_EQ(fixture.textAfter(identityPacket(186, value), "k1xRoamingHome"), text);
}

} // namespace
} // namespace orvex::test
