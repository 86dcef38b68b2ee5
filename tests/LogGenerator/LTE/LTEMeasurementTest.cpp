#include "LTE/ConnectedModeMeasurementMisc.h"
#include "LTE/DetectedCells.h"
#include "LTE/LogCode_0xB179.h"
#include "LTE/MeasuredNeighborCells.h"
#include "LTE/ServingCellMeasurement.h"

#include "BitStringWriter.h"
#include "LogPackets.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

// 0xB179 with these counts, then whatever follows.
Bytes connectedMode(std::uint8_t neighbors, std::uint8_t detected, const Bytes& records = {})
{
    Bytes payload = {
        9, 9, 9, 9, 0x01, 0x02, 0x03, 0x04, 0x05, 0x06, 0x18, 0x01, 0x50, 0x00, neighbors, detected};
    payload.insert(payload.end(), records.begin(), records.end());
    return packet(0xB179, payload);
}

TEST(ConnectedModeMeasurementMisc, ReadsAndScalesItsFields)
{
    SectionFixture<ConnectedModeMeasurementMisc> fixture;
    EXPECT_EQ(fixture.rowsAfter(connectedMode(0, 0), 0xB179),
        (RowTexts{{"E-ARFCN", "513"}, {"Serving Physical Cell ID", "1027"}, {"Subframe Number", "1541"},
            {"Serving Filtered RSRP", "-70.00 dBm"}, {"Serving Filtered RSRQ", "-10.00 dB"}}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>Connected mode LTE Intra-frequency Measurement"});

    const struct {
        std::uint8_t low, high;
        const char* rsrp;
        const char* rsrq;
    } ends[] = {{0x00, 0x00, "-140.00 dBm", "-20.00 dB"}, {0x01, 0x00, "-139.75 dBm", "-19.88 dB"},
        {0xFF, 0xFF, "16243.75 dBm", "8171.88 dB"}};
    for (const auto& [low, high, rsrp, rsrq] : ends) {
        Bytes bytes = connectedMode(0, 0);
        bytes[23] = bytes[25] = low;
        bytes[24] = bytes[26] = high;
        const RowTexts rows = fixture.rowsAfter(bytes, 0xB179);
        EXPECT_EQ(textOf(rows, "Serving Filtered RSRP"), rsrp);
        EXPECT_EQ(textOf(rows, "Serving Filtered RSRQ"), rsrq);
    }
}

TEST(ConnectedModeLists, ShowTheRecordsOfTheirCountsThatFit)
{
    const Bytes twoAndOne = {
        0x01, 0x01, 0x18, 0x01, 0x50, 0x00, 0xF7, 0x01, 0x00, 0x00, 0xA0, 0x00, 0x2A, 0x00};
    const std::vector<RowTexts> measured = {
        {{"Physical Cell ID", "257"}, {"Filtered RSRP", "-70.00 dBm"}, {"Filtered RSRQ", "-10.00 dB"}},
        {{"Physical Cell ID", "503"}, {"Filtered RSRP", "-140.00 dBm"}, {"Filtered RSRQ", "0.00 dB"}},
    };
    const std::vector<RowTexts> detected = {{{"Physical Cell ID", "42"}}};
    const Bytes cutInFirst(twoAndOne.begin(), twoAndOne.begin() + 5);
    const struct {
        const char* name;
        Bytes packet;
        std::vector<RowTexts> measured;
        std::vector<RowTexts> detected;
    } cases[] = {
        {"two and one", connectedMode(2, 1, twoAndOne), measured, detected},
        {"none", connectedMode(0, 0), {}, {}},
        {"more detected than fit", connectedMode(2, 255, twoAndOne), measured, detected},
        {"more measured than fit", connectedMode(255, 255, twoAndOne), measured, {}},
        {"first measured cut", connectedMode(2, 1, cutInFirst), {}, {}},
        {"no measured, so detected ones stand first", connectedMode(0, 1, twoAndOne), {},
            {{{"Physical Cell ID", "257"}}}},
    };
    SectionFixture<MeasuredNeighborCells> neighbors;
    SectionFixture<DetectedCells> cells;
    for (const auto& [name, bytes, expectedMeasured, expectedDetected] : cases) {
        // "more measured than fit": two records fit, the third would begin with the detected cell.
        EXPECT_EQ(neighbors.listAfter(bytes, 0xB179), expectedMeasured) << name;
        EXPECT_EQ(cells.listAfter(bytes, 0xB179), expectedDetected) << name;
    }
}

TEST(LogCode_0xB179, IndexAtTheCountThrows)
{
    const Bytes bytes = connectedMode(1, 2);
    const LogCode_0xB179 measurement(bytes);
    EXPECT_EQ(measurement.measuredNeighbors()[0].physicalCellIdentity(), 0)
        << "counted, but not in the packet";
    EXPECT_THROW(measurement.measuredNeighbors()[1], ArrayOutOfBoundsException);
    EXPECT_THROW(measurement.detectedCells()[2], ArrayOutOfBoundsException);
}

// The 14 bytes of the bit string of 0xB17F behind version and EARFCN.
Bytes idleMode(const BitStringWriter& bits)
{
    Bytes payload = {0x05, 0, 0, 0, 0x9C, 0x18};
    const Bytes string = bits.bytes(14);
    payload.insert(payload.end(), string.begin(), string.end());
    return packet(0xB17F, payload);
}

TEST(ServingCellMeasurement, ReadsEachFieldFromItsOwnBits)
{
    const BitStringWriter bits = BitStringWriter()
                                     .put(0, 9, 501)
                                     .put(9, 4, 6)
                                     .put(13, 3, 7)
                                     .put(16, 9, 280)
                                     .put(25, 9, 279)
                                     .put(34, 7, 80)
                                     .put(41, 7, 77)
                                     .put(48, 9, 151)
                                     .put(57, 6, 5)
                                     .put(63, 7, 53)
                                     .put(70, 6, 53)
                                     .put(76, 4, 15)
                                     .put(80, 7, 100)
                                     .put(87, 6, 33)
                                     .put(93, 6, 31)
                                     .put(99, 6, 4)
                                     .put(105, 1, 1)
                                     .put(106, 4, 9)
                                     .put(110, 2, 3);
    SectionFixture<ServingCellMeasurement> fixture;
    EXPECT_EQ(fixture.rowsAfter(idleMode(bits), 0xB17F),
        (RowTexts{{"Version", "5"}, {"E-ARFCN", "6300"}, {"Physical Cell ID", "501"},
            {"Serving Layer Priority", "6"}, {"Measured RSRP", "-70.00 dBm"}, {"Average RSRP", "-70.25 dBm"},
            {"Measured RSRQ", "-10.00 dB"}, {"Average RSRQ", "-10.75 dB"}, {"Measured RSSI", "-64.50 dBm"},
            {"Qrxlevmin", "-130 dBm"}, {"P_Max", "23 dBm"}, {"Max UE Tx Power", "23 dBm"},
            {"Srxlev", "70 dBm"}, {"Num of Consecutive DRX Cycles of S < 0", "33"},
            {"S Intra Search", "62 dB"}, {"S Non Intra Search", "8 dBm"},
            {"Measurement Rules Updated", "True"}, {"Measurement Rules", "9"}}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>Serving Cell Measurements"});
}

TEST(ServingCellMeasurement, ShowsTheEndsOfEachRange)
{
    SectionFixture<ServingCellMeasurement> fixture;
    EXPECT_EQ(fixture.rowsAfter(idleMode({}), 0xB17F),
        (RowTexts{{"Version", "5"}, {"E-ARFCN", "6300"}, {"Physical Cell ID", "0"},
            {"Serving Layer Priority", "0"}, {"Measured RSRP", "-140.00 dBm"},
            {"Average RSRP", "-140.00 dBm"}, {"Measured RSRQ", "-30.00 dB"}, {"Average RSRQ", "-30.00 dB"},
            {"Measured RSSI", "-140.00 dBm"}, {"Qrxlevmin", "-140 dBm"}, {"P_Max", "-30 dBm"},
            {"Max UE Tx Power", "-30 dBm"}, {"Srxlev", "-30 dBm"},
            {"Num of Consecutive DRX Cycles of S < 0", "0"}, {"S Intra Search", "0 dB"},
            {"S Non Intra Search", "0 dBm"}, {"Measurement Rules Updated", "False"},
            {"Measurement Rules", "0"}}));

    BitStringWriter full;
    for (std::size_t bit = 0; bit < 112; ++bit)
        full.put(bit, 1, 1);
    EXPECT_EQ(fixture.rowsAfter(idleMode(full), 0xB17F),
        (RowTexts{{"Version", "5"}, {"E-ARFCN", "6300"}, {"Physical Cell ID", "511"},
            {"Serving Layer Priority", "15"}, {"Measured RSRP", "-12.25 dBm"}, {"Average RSRP", "-12.25 dBm"},
            {"Measured RSRQ", "1.75 dB"}, {"Average RSRQ", "1.75 dB"}, {"Measured RSSI", "115.50 dBm"},
            {"Qrxlevmin", "-14 dBm"}, {"P_Max", "97 dBm"}, {"Max UE Tx Power", "33 dBm"},
            {"Srxlev", "97 dBm"}, {"Num of Consecutive DRX Cycles of S < 0", "63"},
            {"S Intra Search", "126 dB"}, {"S Non Intra Search", "126 dBm"},
            {"Measurement Rules Updated", "True"}, {"Measurement Rules", "15"}}));
}

TEST(ServingCellMeasurement, TellsValuesThatStandForNone)
{
    SectionFixture<ServingCellMeasurement> fixture;
    const RowTexts rows =
        fixture.rowsAfter(idleMode(BitStringWriter().put(63, 7, 64).put(93, 6, 32).put(99, 6, 32)), 0xB17F);
    EXPECT_EQ(textOf(rows, "P_Max"), "Not Present");
    EXPECT_EQ(textOf(rows, "S Intra Search"), "Not Present");
    EXPECT_EQ(textOf(rows, "S Non Intra Search"), "Not Present");
}

} // namespace
} // namespace orvex::test
