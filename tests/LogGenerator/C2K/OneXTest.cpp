// Decoders of 1x: status with its subpackets and pilots, traffic frames, system identity.

#include "C2KFixture.h"

#include "C2K/OneXStatus.h"
#include "RecordList.h"

namespace orvex::test {
namespace {

// The subpackets of 0x119C: device state, radio, active set, fingers.
const std::string kState = "01 EE 0500 08 ";
const std::string kRadio = "02 EE 0E00 01 02 0201 0403 F6 7E 85FF ";
const std::string kNoPilots = "03 EE 0C00 0100 01 09 00 00 00 00 ";
const std::string kFingers = "04 EE 0400 ";
const std::string kFour = "119C: EE 04 EE EE ";

std::string statusOf(int deviceState, const std::string& radio = kRadio, const std::string& set = kNoPilots)
{
    return kFour + text("01 EE 0500 %02X ", deviceState) + radio + set + kFingers;
}

TEST(OneXStatus, ReadsEachFieldFromItsOwnBytes)
{
    C2KFixture fixture;
    const std::string first = "k1xRx0BandClass=1.8 to 2.0GHz PCS band [1], k1xRx0ChanNum=258, "
                              "k1xRxAGC0=-66.59 dBm, ";
    EXPECT_EQ(fixture.shownAfter(statusOf(8)),
        "k1xDeviceState=Traffic [8], " + first
            + "k1xRx1BandClass=872 to 960MHz TACS band [2], k1xRx1ChanNum=772, k1xRxAGC1=-21.16 dBm, "
              "k1xTxAGC=-12.30 dBm, k1xActiveSetInfo={_sorted=_sorted}");
    EXPECT_EQ(fixture.shownAfter(statusOf(7)),
        "k1xDeviceState=Slotted mode sleep state [7], " + first
            + "k1xRx1BandClass=N/A, k1xRx1ChanNum=N/A, k1xRxAGC1=N/A, k1xTxAGC=N/A, "
              "k1xActiveSetInfo={_sorted=_sorted}");
    EXPECT_EQ(fixture.linesNow(), "");

    const std::pair<int, const char*> states[] = {{0, "Inactive [0]"}, {1, "Deep sleep in start state [1]"},
        {2, "Initial state for CDMA operation [2]"}, {3, "Acquisition [3]"}, {4, "Sync [4]"}, {5, "Slew [5]"},
        {6, "Paging [6]"}, {9, "UnSlew [9]"}, {10, "Operation in PCG state [10]"}, {11, "Powerup state [11]"},
        {12, "[Bad Value 12]"}};
    for (const auto& [value, expected] : states)
        EXPECT_EQ(fixture.textAfter(statusOf(value), "k1xDeviceState"), expected);
    const std::pair<int, const char*> bands[] = {{7, "700MHz band [7]"}, {8, "1800 MHz band [8]"},
        {10, "Secondary 800 MHz band [10]"}, {11, "400 MHz European PAMR band [11]"},
        {255, "[Bad Value 255]"}};
    for (const auto& [value, expected] : bands)
        EXPECT_EQ(fixture.textAfter(statusOf(0, text("02 EE 0E00 %02X 00*9 ", value)), "k1xRx0BandClass"),
            expected);
}

TEST(OneXStatus, NeedsItsFourSubpackets)
{
    const std::string all[] = {kState, kRadio, kNoPilots, kFingers};
    C2KFixture fixture;
    for (unsigned missing = 0; missing < 5; ++missing) {
        std::string packet = "119C: EE 05 EE EE 63 EE 0600 01 02 ";
        for (const unsigned i : {3U, 0U, 2U, 1U}) // in any order
            packet += i == missing ? "63 EE 0400 " : all[i];
        EXPECT_EQ(fixture.shownAfter(packet).empty(), missing < 4) << packet;
        const auto is = [missing](unsigned i) { return i == missing ? 0 : 1; };
        EXPECT_EQ(fixture.linesNow(),
            missing == 4 ? ""
                         : text("<4>Log code 0x119c: missing subpacket (ss=%d,rf=%d,ai=%d,fi=%d).", is(0),
                             is(1), is(2), is(3)));
    }
}

// A subpacket may claim up to 16 bytes beyond the packet. Only rows whose field is inside are written.
TEST(OneXStatus, FieldBehindThePacketLeavesItsRow)
{
    C2KFixture fixture;
    const auto lostBy = [&fixture](const std::string& packet, std::size_t cut) {
        Bytes bytes = packetOfText(packet);
        bytes.resize(bytes.size() - cut);
        fixture.clear();
        fixture.feed(bytes);
        std::string lost;
        for (const char* row : {"k1xRx0BandClass", "k1xRx1BandClass", "k1xRx0ChanNum", "k1xRx1ChanNum",
                 "k1xRxAGC0", "k1xRxAGC1", "k1xTxAGC", "k1xActiveSetInfo"})
            lost += fixture.display->contains(row) ? "" : row + std::string(" ");
        return lost;
    };
    const std::string radioLast = kFour + kState + kNoPilots + kFingers + kRadio;
    EXPECT_EQ(lostBy(radioLast, 1), "k1xTxAGC ");
    EXPECT_EQ(lostBy(radioLast, 3), "k1xRxAGC1 k1xTxAGC ");
    EXPECT_EQ(
        lostBy(radioLast, 9), "k1xRx1BandClass k1xRx0ChanNum k1xRx1ChanNum k1xRxAGC0 k1xRxAGC1 k1xTxAGC ");
    EXPECT_EQ(lostBy(kFour + kState + kRadio + kFingers + kNoPilots, 1), "k1xActiveSetInfo ");
    fixture.state.set("TrafficFER", 0.5);
    EXPECT_EQ(lostBy(kFour + kRadio + kNoPilots + kFingers + kState, 1),
        "k1xRx1BandClass k1xRx1ChanNum k1xRxAGC1 k1xTxAGC ");
    EXPECT_EQ(fixture.state["TrafficFER"], Value(0.5));
    EXPECT_EQ(fixture.linesNow(), "");
}

TEST(OneXStatus, ListsPilotsWithTheirStrength)
{
    // A set of 120 bytes: m, g, c, number of pilots and fingers, PN 7, and the energy of the first pilot.
    const auto set = [](const char* mgc, const char* energy) {
        return text("03 EE 7800 %s 01 00 0000 0700 00*10 %s 00*94 ", mgc, energy);
    };
    const std::pair<std::string, const char*> cases[] = {
        // Two pilots of one finger, 20 bytes apart; the reference PN is that of the second.
        {"03 EE 3200 0201 03 09 02 01 2C01 0401 EE*14 0403 EE*2 2C01 EE*14 1000 ",
            "0;260=+11.48 dB, 1;300=(ref pilot) -5.41 dB"},
        {set("0100 01 00", "4800"), "0;7=-50.00 dB"}, // no more than noise
        {set("0100 01 00", "4900"), "0;7=-18.57 dB"},
        {set("FFFF FF 14", "FFFF"), "0;7=+29.61 dB"}, // m times m is beyond 31 bits
        {set("0100 01 FF", "FFFF"), "0;7=+1564.84 dB"},
        {set("0000 01 09", "0000"), "0;7=-50.00 dB"},
        {set("0100 00 09", "E803"), "0;7=+inf dB"},
    };
    C2KFixture fixture;
    for (const auto& [subpacket, pilots] : cases)
        EXPECT_EQ(fixture.textAfter(statusOf(6, kRadio, subpacket), "k1xActiveSetInfo"),
            std::string("{_sorted=_sorted, ") + pilots + "}");

    const struct {
        int fingers;
        std::size_t length; // of the active set, up to the end of the packet
        std::size_t pilots;
    } lengths[] = {{0, 25, 0}, {0, 26, 1}, {0, 37, 1}, {0, 38, 2}, {2, 57, 1}, {2, 58, 2}, {255, 120, 0}};
    for (const auto& [fingers, length, pilots] : lengths) {
        const auto lastSet = text(
            "03 EE %02zX00 0100 01 09 FF %02X 00*%zu", length, static_cast<unsigned>(fingers), length - 10);
        fixture.shownAfter(kFour + kState + kRadio + kFingers + lastSet);
        EXPECT_EQ((*fixture.display)["k1xActiveSetInfo"].dictionary()->size(), pilots + 1) << length;
    }
    const Bytes one = PacketText(set("0100 01 00", "4800")).bytes();
    for (const int index : {-1, 1})
        EXPECT_THROW(
            LogCode_0x119C_ActiveSet(Subpacket(PacketReader(one))).pilot(index), ArrayOutOfBoundsException);
}

TEST(OneXSystemIdentity, ReadsEachFieldFromItsOwnBytes)
{
    const auto packet = [](const char* version, const char* roaming, const char* type, int length) {
        return text(
            "134F: %s @42 %s %s 0201 0403 @131 C8 @133 07 @184 0605 @%d", version, roaming, type, length);
    };
    C2KFixture fixture;
    EXPECT_EQ(fixture.shownAfter(packet("02", "01000000", "02000000", 186)),
        "k1xRoamingHome=ON [1], kSystemId=258, kNetworkId=772, kPacketZoneId=200, kBaseId=1286, "
        "kProtocolRevision=7");
    EXPECT_EQ(fixture.shownAfter(packet("02", "01000000", "03000080", 171)),
        "k1xRoamingHome=ON [1], kSystemId=(unknown system type -2147483645), "
        "kNetworkId=(unknown system type -2147483645), kPacketZoneId=200, kProtocolRevision=7");
    EXPECT_EQ(fixture.textAfter(packet("02", "01000000", "02000000", 185), "kBaseId"), "(absent)");
    EXPECT_EQ(fixture.shownAfter(packet("01", "01000000", "02000000", 186)), "");
    EXPECT_EQ(
        fixture.linesNow(), "<3>Log code 0x134f has version=1; only version 2 or higher expected; dropping.");

    const std::pair<const char*, const char*> roaming[] = {{"00000000", "OFF [0]"},
        {"02000000", "Flashing [2]"}, {"03000000", "Out of Neighborhood [3]"},
        {"04000000", "Out of Building [4]"}, {"05000000", "Preferred system [5]"},
        {"06000000", "Available system [6]"}, {"07000000", "Alliance partner [7]"},
        {"08000000", "Premium partner [8]"}, {"09000000", "Full service functionality [9]"},
        {"0A000000", "Partial service functionality [10]"}, {"0B000000", "Banner ON [11]"},
        {"0C000000", "Banner OFF [12]"}, {"0D000000", "ERI - 13"}, {"FFFFFFFF", "ERI - -1"}};
    for (const auto& [value, expected] : roaming)
        EXPECT_EQ(fixture.textAfter(packet("02", value, "02000000", 186), "k1xRoamingHome"), expected);
}

TEST(SubpacketWalk, FindsWithinItsBounds)
{
    const char* missing = "<4>Log code 0x119d: missing traffic demod subpacket.";
    // The demodulation subpacket is 42 bytes long with its packet's beginning; a claim may reach to 58.
    const struct {
        const char* packet;
        bool isFound;
        const char* lines = "";
    } cases[] = {
        {"119D: EE 01 EE EE 0B EE 0000 01*21", true}, {"119D: EE 01 EE EE 0B EE 2900 01*21", true},
        {"119D: EE 01 EE EE 0B EE 2A00 01*21", false,
            "<3>Log code error in subpkt#0: bad size (42).<4>Log code 0x119d: missing traffic demod "
            "subpacket."},
        {"119D: EE 02 EE EE 05 EE 0400 0B EE FFFF 01*21", false,
            "<3>Log code error in subpkt#1: bad size (65535).<4>Log code 0x119d: missing traffic demod "
            "subpacket."},
        {"119D: EE 00 EE EE 0B EE 1900 01*21", false, missing},
        {"119D: EE 01 EE EE 05 EE 0400 0B EE 1900 01*21", false, missing},
        {"119D: EE FF EE EE 05 EE 0000 0B EE 1900 01*21", false, missing}, // stays at a size of zero
        {"119D: EE 02 EE EE 05 EE 0400 0B 00 04", false, missing},
        {"119D: EE 01 EE EE 0B EE 1900 01*20", false}, // the error byte is behind the packet
    };
    C2KFixture fixture;
    for (const auto& [packet, isFound, lines] : cases) {
        EXPECT_EQ(!fixture.shownAfter(packet).empty(), isFound) << packet;
        EXPECT_EQ(fixture.linesNow(), lines) << packet;
    }
}

TEST(TrafficFER, AveragesInSinglePrecision)
{
    C2KFixture fixture;
    const char* row = "k1xTrafficFER";
    const auto frame = [&](int error) {
        return fixture.textAfter(text("119D: EE 01 EE EE 0B EE 1900 00*20 %02d", error), row);
    };
    const auto status = [&](int deviceState) { return fixture.textAfter(statusOf(deviceState), row); };
    EXPECT_EQ(frame(2), "1.56%");
    EXPECT_EQ(frame(0), "1.54%");
    EXPECT_EQ(status(8), "(absent)");
    EXPECT_EQ(status(6), "1.54% (old)");
    EXPECT_EQ(status(6), "(absent)") << "shown once";
    EXPECT_EQ(frame(0), "0.00%") << "a new average";

    fixture.state.remove("TrafficFER");
    for (int i = 0; i < 60; ++i)
        frame(i < 59 ? 1 : 0);
    EXPECT_EQ(frame(0), "58.64%") << "58.63% in double precision";
    fixture.state.remove("TrafficFER");
    for (const int error : {1, 1, 1, 1, 0, 1})
        frame(error);
    EXPECT_EQ(fixture.state["TrafficFER"], Value(0.07478243112564087)) << "each step is rounded";
    fixture.state.set("TrafficFER", static_cast<double>(0.00625F));
    EXPECT_EQ(status(6), "0.62% (old)") << "0.63% in double precision";
}

} // namespace
} // namespace orvex::test
