#include "C2KFixture.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

Bytes systemState(std::uint8_t state)
{
    return subpacket(1, {state});
}

Bytes radio(std::uint8_t bandClass = 0)
{
    return subpacket(2, {bandClass, 2, 0x02, 0x01, 0x04, 0x03, 0xF6, 0x7E, 0x85, 0xFF});
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
            {"k1xRxAGC1", "-21.16 dBm"}, {"k1xTxAGC", "-12.30 dBm"}, {"k1xActiveSetInfo", "(dictionary)"}}));
    for (const auto state : Bytes{7, 9}) {
        const auto idle = fixture.rowsAfter(statusPacket(state));
        for (const char* row : {"k1xRx1BandClass", "k1xRx1ChanNum", "k1xRxAGC1", "k1xTxAGC"})
            EXPECT_EQ(textOf(idle, row), "N/A");
        EXPECT_EQ(textOf(idle, "k1xRxAGC0"), "-66.59 dBm");
    }
    EXPECT_EQ(fixture.log.take(), Lines{});
}

TEST(OneXStatus, NamesStatesAndBandClasses)
{
    const std::pair<std::uint8_t, const char*> states[] = {{0, "Inactive [0]"},
        {1, "Deep sleep in start state [1]"}, {2, "Initial state for CDMA operation [2]"},
        {3, "Acquisition [3]"}, {4, "Sync [4]"}, {5, "Slew [5]"}, {6, "Paging [6]"},
        {7, "Slotted mode sleep state [7]"}, {8, "Traffic [8]"}, {9, "UnSlew [9]"},
        {10, "Operation in PCG state [10]"}, {11, "Powerup state [11]"}, {12, "[Bad Value 12]"},
        {255, "[Bad Value 255]"}};
    C2KFixture fixture;
    for (const auto& [value, text] : states)
        EXPECT_EQ(fixture.textAfter(statusPacket(value), "k1xDeviceState"), text);
    const std::pair<std::uint8_t, const char*> bandClasses[] = {{7, "700MHz band [7]"},
        {8, "1800 MHz band [8]"}, {10, "Secondary 800 MHz band [10]"},
        {11, "400 MHz European PAMR band [11]"}, {255, "[Bad Value 255]"}};
    for (const auto& [value, text] : bandClasses)
        EXPECT_EQ(fixture.textAfter(statusPacket(0, radio(value)), "k1xRx0BandClass"), text);
}

TEST(OneXStatus, NeedsItsFourSubpackets)
{
    const Bytes all[] = {systemState(8), radio(), kNoPilots, kFingerInfo};
    C2KFixture fixture;
    for (unsigned present = 0; present < 16; ++present) {
        std::vector<Bytes> subpackets = {subpacket(99, {1, 2})};
        for (const unsigned i : {3U, 0U, 2U, 1U}) { // in any order
            if (present >> i & 1U)
                subpackets.push_back(all[i]);
        }
        EXPECT_EQ(fixture.rowsAfter(packetOf(0x119C, subpackets)).size(), present == 15 ? 9U : 0U) << present;
        const auto is = [present](unsigned i) { return present >> i & 1U; };
        EXPECT_EQ(fixture.log.take(),
            present == 15 ? Lines{}
                          : Lines{text("<4>Log code 0x119c: missing subpacket (ss=%u,rf=%u,ai=%u,fi=%u).",
                              is(0), is(1), is(2), is(3))});
    }
}

// An active set of 120 bytes and these, of m, g, c and the energy of the first pilot.
Bytes activeSet(unsigned m, std::uint8_t g, std::uint8_t c, unsigned energy, std::uint8_t count = 1)
{
    const auto low = [](unsigned value) { return static_cast<std::uint8_t>(value); };
    const auto high = [](unsigned value) { return static_cast<std::uint8_t>(value >> 8); };
    Bytes body = {low(m), high(m), g, c, count, 0, 0, 0, 7, 0};
    body.resize(116);
    body[20] = low(energy);
    body[21] = high(energy);
    return subpacket(3, body);
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
        {"no more than noise", activeSet(1, 1, 0, 72), "-50.00 dB"},
        {"just more", activeSet(1, 1, 0, 73), "-18.57 dB"},
        {"scale", activeSet(1, 2, 2, 1000), "+20.42 dB"},
        {"m times m beyond 31 bits", activeSet(65535, 255, 20, 65535), "+29.61 dB"},
        {"highest scale", activeSet(1, 1, 255, 65535), "+1564.84 dB"},
        {"m of zero", activeSet(0, 1, 9, 1000), "-50.00 dB"},
        {"m and energy of zero", activeSet(0, 1, 9, 0), "-50.00 dB"},
        {"g of zero", activeSet(1, 0, 9, 1000), "+inf dB"},
    };
    C2KFixture fixture;
    for (const auto& [name, set, strength] : cases)
        EXPECT_EQ(fixture.listAfter(statusPacket(6, radio(), set), "k1xActiveSetInfo"),
            (RowTexts{{"_sorted", "_sorted"}, {"0;7", strength}}))
            << name;
}

TEST(OneXStatus, ShowsThePilotsThatFit)
{
    const struct {
        std::uint8_t fingers;
        std::size_t length; // of the active set, up to the end of the packet
        std::size_t pilots;
    } cases[] = {{0, 25, 0}, {0, 26, 1}, {0, 37, 1}, {0, 38, 2}, {2, 33, 0}, {2, 34, 1}, {2, 58, 2},
        {20, 237, 1}, {20, 238, 2}, {255, 120, 0}};
    C2KFixture fixture;
    for (const auto& [fingers, length, pilots] : cases) {
        Bytes set = activeSet(1, 1, 9, 1, 255);
        set[9] = fingers;
        set.resize(length);
        const Bytes bytes = packetOf(
            0x119C, {systemState(6), radio(), kFingerInfo, subpacket(3, Bytes(set.begin() + 4, set.end()))});
        EXPECT_EQ(fixture.listAfter(bytes, "k1xActiveSetInfo").size(), pilots + 1) << length;
    }
}

TEST(OneXStatus, FieldBehindThePacketLeavesItsRow)
{
    const struct {
        std::size_t cut; // from the end of the radio's subpacket
        std::size_t rows;
        const char* lost; // among others
    } cases[] = {{0, 9, "-"}, {1, 8, "k1xTxAGC"}, {3, 7, "k1xRxAGC1"}, {4, 6, "k1xRxAGC0"},
        {5, 5, "k1xRx1ChanNum"}, {7, 4, "k1xRx0ChanNum"}, {9, 3, "k1xRx1BandClass"},
        {10, 2, "k1xRx0BandClass"}};
    C2KFixture fixture;
    for (const auto& [cut, rowCount, lost] : cases) {
        Bytes bytes = packetOf(0x119C, {systemState(8), kNoPilots, kFingerInfo, radio()});
        bytes.resize(bytes.size() - cut);
        const auto rows = fixture.rowsAfter(bytes);
        EXPECT_EQ(rows.size(), rowCount) << cut;
        EXPECT_EQ(textOf(rows, lost), "(absent)") << cut;
    }
    Bytes noState = packetOf(0x119C, {radio(), kNoPilots, kFingerInfo, systemState(8)});
    noState.pop_back();
    fixture.state.set("TrafficFER", 0.5);
    EXPECT_EQ(fixture.rowsAfter(noState).size(), 4U) << "receiver 0 and active set";
    EXPECT_EQ(fixture.state["TrafficFER"], Value(0.5));
    Bytes noHead = packetOf(0x119C, {systemState(8), radio(), kFingerInfo, kNoPilots});
    EXPECT_EQ(fixture.textAfter(noHead, "k1xActiveSetInfo"), "(dictionary)");
    noHead.pop_back();
    EXPECT_EQ(fixture.textAfter(noHead, "k1xActiveSetInfo"), "(absent)");
    EXPECT_EQ(fixture.log.take(), Lines{});
}

} // namespace
} // namespace orvex::test
