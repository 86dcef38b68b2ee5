// Decoders of EV-DO status, active set and fingers.

#include "C2KFixture.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

// EV-DO status with these bytes of channel and band class, states, and PN offset.
Bytes statusPacket(Bytes channel, std::uint8_t deviceState, std::uint8_t sessionState = 4,
    Bytes pnOffset = {0x10, 0x00}, std::size_t length = 50)
{
    return packetWith(0x1183, length,
        {{13, channel}, {15, {0x80, 0xFB, 0xF4}}, {18, pnOffset}, {36, {deviceState, sessionState}},
            {38, {0x0A, 0xBC, 0x03, 200}}});
}

TEST(EVDOStatus, ReadsEachFieldFromItsOwnBits)
{
    C2KFixture fixture;
    EXPECT_EQ(fixture.rowsAfter(statusPacket({0x34, 0x4D}, 4)),
        (RowTexts{{"kChannel", "1332"}, {"k1xEVDODeviceState", "Access [4]"},
            {"kBandClass", "900 MHzband [9]"}, {"kRxAGC0", "-128 dBm"}, {"kRxAGC1", "-5 dBm"},
            {"kTxAGC", "-12 dBm"}, {"kServingPNOffset", "16 × 64chips"}, {"kSessionState", "Open [4]"},
            {"kUATI24", "0x03bc0a"}, {"kColorCode", "200"}}));
    EXPECT_EQ(fixture.log.take(), Lines{});

    Bytes strong = statusPacket({0, 0}, 4);
    strong[15] = 127;
    EXPECT_EQ(fixture.textAfter(strong, "kRxAGC0"), "+127 dBm");
    EXPECT_EQ(fixture.textAfter(statusPacket({0xFF, 0x07}, 4), "kChannel"), "2047");
    EXPECT_EQ(
        fixture.textAfter(statusPacket({0, 0}, 4, 4, {0xFF, 0xFF}), "kServingPNOffset"), "Invalid Value");
    EXPECT_EQ(
        fixture.textAfter(statusPacket({0, 0}, 4, 4, {0xFE, 0xFF}), "kServingPNOffset"), "65534 × 64chips");
}

TEST(EVDOStatus, NamesStatesAndBandClasses)
{
    const struct {
        std::uint8_t value;
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
        {13, "[Reserved 13]", "[Reserved 13]", "[Bad Value 13]"},
        {31, "[Reserved 31]", "[Reserved 31]", "[Bad Value 31]"},
        {255, "[Reserved 255]", "[Reserved 255]", "[Bad Value 31]"},
    };
    C2KFixture fixture;
    for (const auto& [value, deviceState, sessionState, bandClass] : cases) {
        const auto rows =
            fixture.rowsAfter(statusPacket({0, static_cast<std::uint8_t>(value << 3 | 7)}, value, value));
        EXPECT_EQ(textOf(rows, "k1xEVDODeviceState"), deviceState);
        EXPECT_EQ(textOf(rows, "kSessionState"), sessionState);
        EXPECT_EQ(textOf(rows, "kBandClass"), bandClass);
        EXPECT_EQ(textOf(rows, "kRxAGC0"), "-128 dBm");
        EXPECT_EQ(textOf(rows, "kRxAGC1"), value >= 4 ? "-5 dBm" : "N/A") << int{value};
        EXPECT_EQ(textOf(rows, "kTxAGC"), value >= 4 ? "-12 dBm" : "N/A") << int{value};
    }
}

TEST(EVDOStatus, HasOneLength)
{
    C2KFixture fixture;
    for (const std::size_t length : {13U, 49U, 51U}) {
        EXPECT_EQ(fixture.rowsAfter(statusPacket({0, 0}, 4, 4, {0, 0}, length)), RowTexts{});
        EXPECT_EQ(fixture.log.take(),
            Lines{text("<3>Log code 0x1183 is %zu bytes long but should be 50 bytes.", length)});
    }
}

Bytes activeSetPacket(std::uint8_t count, std::size_t length)
{
    return packetWith(0x12B6, length,
        {{15, {count}}, {25, {0x02, 0x01, 0x00, 0x02}}, {37, {0x2C, 0x01, 0x00, 0x00}},
            {49, {0x02, 0x01, 0x04, 0x03}}, {61, {0xFF, 0xFF, 0xFF, 0xFF}}});
}

TEST(EVDOActiveSet, ListsPilotsWithTheirStrength)
{
    C2KFixture fixture;
    EXPECT_EQ(fixture.listAfter(activeSetPacket(4, 73), "kActiveSetPilots"),
        (RowTexts{{"_sorted", "_sorted"}, {"0;258", "+0.00 dB"}, {"1;300", "-inf dB"}, {"2;258", "+1.78 dB"},
            {"3;65535", "+21.07 dB"}}));
    EXPECT_EQ(fixture.textAfter(activeSetPacket(0, 73), "kActiveSetPilots"), "(none)");
    EXPECT_EQ(fixture.textAfter(activeSetPacket(3, 73), "kActiveSetPilots"), "(dictionary)")
        << "bytes behind the pilots do not matter";
    EXPECT_EQ(fixture.log.take(), Lines{});

    for (const auto& [count, length] : {std::pair(4, 72U), {1, 36U}, {255, 73U}}) {
        EXPECT_EQ(fixture.rowsAfter(activeSetPacket(static_cast<std::uint8_t>(count), length)), RowTexts{});
        EXPECT_EQ(fixture.log.take(),
            Lines{text("<3>Log code 0x12b6 is %u bytes long, but has %d substructs.", length, count)});
    }
}

// Four fingers, of which the second is idle.
Bytes fingerPacket(std::uint8_t count, std::size_t length)
{
    return packetWith(0x108A, length,
        {{22, {count}}, {23, {0x02, 0x01}}, {29, {0x01, 0x02}}, {37, {0xFF, 0xFF}}, {51, {0x2C, 0x01}},
            {57, {0x2C, 0x01}}, {65, {0xFE, 0xFF}}, {71, {0, 0}}});
}

TEST(EVDOFingers, ListsBusyFingersUnderTheirNumber)
{
    C2KFixture fixture;
    EXPECT_EQ(fixture.listAfter(fingerPacket(4, 79), "kFingerC2I"),
        (RowTexts{
            {"_sorted", "_sorted"}, {"0;258", "+0.01 dB"}, {"2;300", "-2.32 dB"}, {"3;65534", "-inf dB"}}));
    EXPECT_EQ(fixture.textAfter(fingerPacket(0, 23), "kFingerC2I"), "(none)");
    const Bytes idle = packetWith(0x108A, 37, {{22, {1}}, {23, {0xFF, 0xFF}}});
    EXPECT_EQ(fixture.textAfter(idle, "kFingerC2I"), "(none)");
    EXPECT_EQ(fixture.log.take(), Lines{});

    for (const auto& [count, length] : {std::pair(4, 78U), {4, 80U}, {0, 24U}, {255, 79U}}) {
        EXPECT_EQ(fixture.rowsAfter(fingerPacket(static_cast<std::uint8_t>(count), length)), RowTexts{});
        EXPECT_EQ(fixture.log.take(),
            Lines{text("<3>Log code 0x108a has bad length of %u bytes, but has %d substructs (size=23).",
                length, count)});
    }
}

} // namespace
} // namespace orvex::test
