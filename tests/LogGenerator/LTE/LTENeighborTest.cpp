#include "LTE/LogCode_0xB186.h"
#include "LTE/NeighborCellsList.h"
#include "LTE/NeighborMeasurementMisc.h"
#include "LTE/ReselectionCandidatesList.h"
#include "LTE/ReselectionCandidatesMisc.h"

#include "BitStringWriter.h"
#include "LogPackets.h"
#include "SectionFixture.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

Bytes neighborPacket(unsigned qRxLevMin, unsigned countLessOne, const std::vector<BitStringWriter>& records)
{
    Bytes payload = {0x03, 0, 0, 0, 0x9C, 0x18};
    const Bytes header =
        BitStringWriter().put(0, 6, qRxLevMin).put(6, 5, countLessOne).put(11, 5, 31).bytes(2);
    payload.insert(payload.end(), header.begin(), header.end());
    for (const BitStringWriter& record : records) {
        const Bytes bytes = record.bytes(20);
        payload.insert(payload.end(), bytes.begin(), bytes.end());
    }
    return packet(0xB180, payload);
}

TEST(NeighborMeasurementMisc, ReadsItsHeader)
{
    SectionFixture<NeighborMeasurementMisc> fixture;
    EXPECT_EQ(fixture.rowsAfter(neighborPacket(5, 0, {}), 0xB180),
        (RowTexts{{"Version", "3"}, {"E-ARFCN", "6300"}, {"Qrxlevmin", "-130 dBm"}}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>Neighbor Measurements"});
    EXPECT_EQ(textOf(fixture.rowsAfter(neighborPacket(63, 0, {}), 0xB180), "Qrxlevmin"), "-14 dBm");
}

TEST(NeighborCellsList, ReadsEachFieldOfARecordFromItsOwnBits)
{
    const BitStringWriter record = BitStringWriter()
                                       .put(0, 9, 257)
                                       .put(9, 8, 100)
                                       .put(17, 9, 81)
                                       .put(26, 6, 63)
                                       .put(32, 9, 79)
                                       .put(41, 7, 80)
                                       .put(48, 7, 77)
                                       .put(55, 7, 20)
                                       .put(62, 2, 3)
                                       .put(64, 16, 0x8001)
                                       .put(80, 16, 0xFFFF)
                                       .put(96, 11, 1030)
                                       .put(107, 19, 300000)
                                       .put(126, 34, ~0U);
    SectionFixture<NeighborCellsList> fixture;
    const auto cells = fixture.listAfter(neighborPacket(5, 0, {record}), 0xB180);
    ASSERT_EQ(cells.size(), 1U);
    EXPECT_EQ(cells[0],
        (RowTexts{{"Physical Cell ID", "257"}, {"Measured RSSI", "-90.00 dBm"},
            {"Measured RSRP", "-99.50 dBm"}, {"Average RSRP", "-100.50 dBm"}, {"Measured RSRQ", "-10.00 dB"},
            {"Average RSRQ", "-10.75 dB"}, {"Srxlev", "-10 dBm"}, {"Frequency Offset", "32769"},
            {"Ant 0 Frame Offset", "1030"}, {"Ant 0 Sample Offset", "300000"}, {"Ant 1 Frame Offset", "1030"},
            {"Ant 1 Sample Offset", "300000"}}));
    EXPECT_EQ(fixture.log.take(),
        (Lines{"<4>Neighbor Cells List", "<4>Number of neighboring cells being reported: 1\n",
            "<4>Physical Cell ID: 257\n", "<4>Measured RSSI: -90.000000\n", "<4>Measured RSSI: -99.500000\n",
            "<4>Measured RSSI: -100.500000\n", "<4>Measured RSSI: -10.000000\n",
            "<4>Measured RSSI: -10.750000\n"}));
}

TEST(NeighborCellsList, ShowsTheEndsOfEachRange)
{
    BitStringWriter full;
    for (std::size_t bit = 0; bit < 160; ++bit)
        full.put(bit, 1, 1);
    SectionFixture<NeighborCellsList> fixture;
    const auto cells = fixture.listAfter(neighborPacket(0, 1, {BitStringWriter(), full}), 0xB180);
    ASSERT_EQ(cells.size(), 2U);
    EXPECT_EQ(cells[0],
        (RowTexts{{"Physical Cell ID", "0"}, {"Measured RSSI", "-140.00 dBm"},
            {"Measured RSRP", "-140.00 dBm"}, {"Average RSRP", "-140.00 dBm"}, {"Measured RSRQ", "-30.00 dB"},
            {"Average RSRQ", "-30.00 dB"}, {"Srxlev", "-30 dBm"}, {"Frequency Offset", "0"},
            {"Ant 0 Frame Offset", "0"}, {"Ant 0 Sample Offset", "0"}, {"Ant 1 Frame Offset", "0"},
            {"Ant 1 Sample Offset", "0"}}));
    EXPECT_EQ(cells[1],
        (RowTexts{{"Physical Cell ID", "511"}, {"Measured RSSI", "-12.50 dBm"},
            {"Measured RSRP", "115.50 dBm"}, {"Average RSRP", "115.50 dBm"}, {"Measured RSRQ", "1.75 dB"},
            {"Average RSRQ", "1.75 dB"}, {"Srxlev", "97 dBm"}, {"Frequency Offset", "65535"},
            {"Ant 0 Frame Offset", "2047"}, {"Ant 0 Sample Offset", "524287"}, {"Ant 1 Frame Offset", "2047"},
            {"Ant 1 Sample Offset", "524287"}}));
}

TEST(NeighborCellsList, ListsOneToThirtyTwoCellsAsFarAsTheyFit)
{
    const BitStringWriter record = BitStringWriter().put(0, 9, 7);
    Bytes cut = neighborPacket(0, 2, {record, record});
    cut.pop_back(); // unread, but without it the second record is not whole
    const struct {
        const char* name;
        Bytes packet;
        std::size_t cells;
    } cases[] = {
        {"count bits 0 stand for one", neighborPacket(0, 0, {record, record}), 1},
        {"32", neighborPacket(0, 31, std::vector<BitStringWriter>(32, record)), 32},
        {"more than fit", neighborPacket(0, 31, {record, record}), 2},
        {"the last one cut", cut, 1},
        {"none fits", neighborPacket(0, 0, {}), 0},
    };
    SectionFixture<NeighborCellsList> fixture;
    for (const auto& [name, bytes, cells] : cases)
        EXPECT_EQ(fixture.listAfter(bytes, 0xB180).size(), cells) << name;
    fixture.listAfter(neighborPacket(0, 31, {record}), 0xB180);
    EXPECT_THAT(fixture.log.take(), testing::Contains("<4>Number of neighboring cells being reported: 32\n"));
}

Bytes reselectionPacket(std::uint16_t count, const Bytes& records)
{
    Bytes payload = {0x02, 0, 0x9C, 0x18, 0x01, 0x02, static_cast<std::uint8_t>(count),
        static_cast<std::uint8_t>(count >> 8)};
    payload.insert(payload.end(), records.begin(), records.end());
    return packet(0xB186, payload);
}

TEST(ReselectionCandidatesMisc, ReadsItsHeader)
{
    SectionFixture<ReselectionCandidatesMisc> fixture;
    EXPECT_EQ(fixture.rowsAfter(reselectionPacket(0, {}), 0xB186),
        (RowTexts{{"Version", "2"}, {"Serving EARFCN", "6300"}, {"Serving Cell ID", "513"}}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>Reselection Candidates"});
}

TEST(ReselectionCandidatesList, ReadsTheFieldsOfEachTechnology)
{
    const Bytes fields = {0x01, 0x02, 0x80, 0x43, 0x05, 0x06, 0x07, 0x08};
    const struct {
        const char* name;
        std::uint16_t technology;
        RowTexts rows;
    } cases[] = {
        {"LTE", 0, {{"Candidate RAT Type", "LTE"}, {"E ARFCN", "513"}, {"Cell ID", "135"}}},
        {"UTRAN", 1, {{"Candidate RAT Type", "UTRAN"}, {"U ARFCN", "513"}, {"PSC", "17280"}}},
        {"GERAN", 2, {{"Candidate RAT Type", "GERAN"}, {"ARFCN", "513"}, {"Band", "128"}, {"BSIC ID", "67"}}},
        {"1xRTT", 3,
            {{"Candidate RAT Type", "CDMA1XRTT"}, {"Band", "1"}, {"Channel", "1541"}, {"Pilot", "2055"}}},
        {"HRPD", 4,
            {{"Candidate RAT Type", "CDMAHRPD"}, {"Band", "1"}, {"Channel", "1541"}, {"Pilot", "2055"}}},
        {"unknown", 7, {{"Candidate RAT Type", "??"}}},
        {"unknown by its high byte", 0x0100, {{"Candidate RAT Type", "??"}}},
    };
    SectionFixture<ReselectionCandidatesList> fixture;
    for (const auto& [name, technology, rows] : cases) {
        Bytes records = {
            0x05, 0x01, static_cast<std::uint8_t>(technology), static_cast<std::uint8_t>(technology >> 8)};
        records.insert(records.end(), fields.begin(), fields.end());
        RowTexts expected = {{"Candidate Priority", "261"}};
        expected.insert(expected.end(), rows.begin(), rows.end());
        EXPECT_EQ(fixture.listAfter(reselectionPacket(1, records), 0xB186), (std::vector<RowTexts>{expected}))
            << name;
    }
    EXPECT_EQ(fixture.log.take(), Lines{"<4>Reselection Candidates List"});
}

TEST(ReselectionCandidatesList, CandidatesOverlapAndEndWithThePacket)
{
    // Two LTE candidates 4 bytes apart: the fields of the first are the header of the second.
    const Bytes two = {0x01, 0x00, 0x00, 0x00, 0x02, 0x00, 0x00, 0x00, 0x9C, 0x18, 0x80, 0x00};
    const RowTexts first = {
        {"Candidate Priority", "1"}, {"Candidate RAT Type", "LTE"}, {"E ARFCN", "2"}, {"Cell ID", "0"}};
    const RowTexts second = {
        {"Candidate Priority", "2"}, {"Candidate RAT Type", "LTE"}, {"E ARFCN", "6300"}, {"Cell ID", "1"}};
    const Bytes cut(two.begin(), two.end() - 1);
    const Bytes cdmaWithoutItsLastByte = {0x01, 0x00, 0x03, 0x00, 1, 2, 3, 4, 5, 6, 7};
    const Bytes hrpdWithoutItsLastByte = {0x01, 0x00, 0x04, 0x00, 1, 2, 3, 4, 5, 6, 7};
    const std::vector<RowTexts> zeros(256,
        {{"Candidate Priority", "0"}, {"Candidate RAT Type", "LTE"}, {"E ARFCN", "0"}, {"Cell ID", "0"}});
    const struct {
        const char* name;
        Bytes packet;
        std::vector<RowTexts> cells;
    } cases[] = {
        {"both", reselectionPacket(2, two), {first, second}},
        {"the second's fields are cut", reselectionPacket(2, cut), {first}},
        {"more than fit, the last fields taken for a header too", reselectionPacket(65535, two),
            {first, second, {{"Candidate Priority", "6300"}, {"Candidate RAT Type", "??"}}}},
        {"fields of 8 bytes are cut", reselectionPacket(1, cdmaWithoutItsLastByte), {}},
        {"fields of 8 bytes are cut, HRPD", reselectionPacket(1, hrpdWithoutItsLastByte), {}},
        {"a count of two bytes", reselectionPacket(256, Bytes(2000)), zeros},
        {"unknown technology needs no fields", reselectionPacket(1, {9, 0, 9, 0}),
            {{{"Candidate Priority", "9"}, {"Candidate RAT Type", "??"}}}},
        {"none", reselectionPacket(0, two), {}},
    };
    SectionFixture<ReselectionCandidatesList> fixture;
    for (const auto& [name, bytes, cells] : cases)
        EXPECT_EQ(fixture.listAfter(bytes, 0xB186), cells) << name;
}

TEST(LogCode_0xB186, FieldsOfAnotherTechnologyAndIndicesBeyondTheCountThrow)
{
    const Bytes bytes = reselectionPacket(1, {0, 0, 2, 0, 0, 0, 0, 0});
    const LogCode_0xB186 reselection(bytes);
    const auto candidate = reselection.candidates()[0];
    EXPECT_NO_THROW(candidate.geranFields());
    EXPECT_THROW(candidate.lteFields(), ArrayOutOfBoundsException);
    EXPECT_THROW(candidate.utranFields(), ArrayOutOfBoundsException);
    EXPECT_THROW(candidate.cdmaFields(), ArrayOutOfBoundsException);
    EXPECT_THROW(reselection.candidates()[1], ArrayOutOfBoundsException);
}

} // namespace
} // namespace orvex::test
