// Decoders of EV-DO status, active set and fingers.

#include "C2KFixture.h"

namespace orvex::test {
namespace {

// EV-DO status of this channel and band class, state, and PN offset.
std::string statusOf(const char* channel, int deviceState, const char* offset = "1000", int session = 4)
{
    return text("1183: %s 80 FB F4 %s @36 %02X %02X 0ABC03 C8 @50", channel, offset, deviceState, session);
}

TEST(EVDOStatus, ReadsEachFieldFromItsOwnBits)
{
    C2KFixture fixture;
    EXPECT_EQ(fixture.shownAfter(statusOf("344D", 4)),
        "kChannel=1332, k1xEVDODeviceState=Access [4], kBandClass=900 MHzband [9], kRxAGC0=-128 dBm, "
        "kRxAGC1=-5 dBm, kTxAGC=-12 dBm, kServingPNOffset=16 × 64chips, kSessionState=Open [4], "
        "kUATI24=0x03bc0a, kColorCode=200");
    EXPECT_EQ(fixture.textAfter("1183: 0000 7F @50", "kRxAGC0"), "+127 dBm");
    EXPECT_EQ(fixture.textAfter(statusOf("0000", 4, "FFFF"), "kServingPNOffset"), "Invalid Value");
    EXPECT_EQ(fixture.shownAfter("1183: @51"), "");
    EXPECT_EQ(fixture.linesNow(), "<3>Log code 0x1183 is 51 bytes long but should be 50 bytes.");
}

TEST(EVDOStatus, NamesStatesAndBandClasses)
{
    const struct {
        int value;
        const char* deviceState;
        const char* sessionState;
        const char* bandClass;
    } cases[] = {
        {0, "Inactive [0]", "Closed [0]", "800 MHz cellular band [0]"},
        {1, "Acquisition [1]", "AMP setup [1]", "1.8 to 2.0GHz PCS band [1]"},
        {2, "Sync [2]", "AT-initiated neg [2]", "872 to 960MHz TACS band [2]"},
        {3, "Idle [3]", "Initiated neg [3]", "832 to 925MHz JTACS band [3]"},
        {4, "Access [4]", "Open [4]", "1.75 to 1.87GHz Korean PCS band [4]"},
        {5, "Connected [5]", "[Reserved 5]", "450MHz band [5]"},
        {6, "[Reserved 6]", "[Reserved 6]", "2GHz band [6]"},
        {12, "[Reserved 12]", "[Reserved 12]", "800 MHz European PAMR band [12]"},
        {255, "[Reserved 255]", "[Reserved 255]", "[Bad Value 31]"},
    };
    C2KFixture fixture;
    for (const auto& [value, deviceState, sessionState, bandClass] : cases) {
        const std::string channel = text("00%02X", (value << 3 | 7) & 255);
        EXPECT_EQ(fixture.shownAfter(statusOf(channel.c_str(), value, "1000", value)),
            text("kChannel=1792, k1xEVDODeviceState=%s, kBandClass=%s, kRxAGC0=-128 dBm, %s, "
                 "kServingPNOffset=16 × 64chips, kSessionState=%s, kUATI24=0x03bc0a, kColorCode=200",
                deviceState, bandClass,
                value >= 4 ? "kRxAGC1=-5 dBm, kTxAGC=-12 dBm" : "kRxAGC1=N/A, kTxAGC=N/A", sessionState));
    }
}

TEST(EVDOLists, HoldPilotsAndBusyFingers)
{
    C2KFixture fixture;
    const char* pilots = "kActiveSetPilots";
    const char* fingers = "kFingerC2I";
    const std::string fourPilots = "@25 0201 0002 @37 2C01 0000 @49 0201 0403 @61 FFFF FFFF ";
    const std::string fourFingers = "@23 0201 @29 0102 @37 FFFF @51 2C01 @57 2C01 @65 FEFF @71 0000 ";
    EXPECT_EQ(fixture.textAfter("12B6: @15 04 " + fourPilots + "@73", pilots),
        "{_sorted=_sorted, 0;258=+0.00 dB, 1;300=-inf dB, 2;258=+1.78 dB, 3;65535=+21.07 dB}");
    EXPECT_EQ(fixture.textAfter("12B6: @15 00 " + fourPilots + "@73", pilots), "(none)");
    // The second finger is idle.
    EXPECT_EQ(fixture.textAfter("108A: @22 04 " + fourFingers + "@79", fingers),
        "{_sorted=_sorted, 0;258=+0.01 dB, 2;300=-2.32 dB, 3;65534=-inf dB}");
    EXPECT_EQ(fixture.textAfter("108A: @22 01 FFFF @37", fingers), "(none)");
    EXPECT_EQ(fixture.linesNow(), "");

    for (const auto& [count, length] : {std::pair(4, 72), {255, 73}}) {
        EXPECT_EQ(fixture.shownAfter(text("12B6: @15 %02X @%d", static_cast<unsigned>(count), length)), "");
        EXPECT_EQ(fixture.linesNow(),
            text("<3>Log code 0x12b6 is %d bytes long, but has %d substructs.", length, count));
    }
    for (const auto& [count, length] : {std::pair(4, 78), {4, 80}, {255, 79}}) {
        EXPECT_EQ(fixture.shownAfter(text("108A: @22 %02X @%d", static_cast<unsigned>(count), length)), "");
        EXPECT_EQ(fixture.linesNow(),
            text("<3>Log code 0x108a has bad length of %d bytes, but has %d substructs (size=23).", length,
                count));
    }
}

} // namespace
} // namespace orvex::test
