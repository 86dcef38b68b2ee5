// The lists of WCDMA cells, and of GSM cells as ranked from WCDMA.

#include "GSM/ActiveSet.h"
#include "GSM/DetectedSet.h"
#include "GSM/GSMSet.h"
#include "GSM/MonitoredSet.h"
#include "GSM/UMTSSet.h"
#include "GSM/VirtualActiveSet.h"

#include "CellLists.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;
using Rows = std::vector<RowTexts>;

// A cell entry of 0x417A: scrambling code in the low 13 bits of byte 7, set type in the 3 bits above.
Bytes cellEntry(unsigned scramblingCode, unsigned setType)
{
    Bytes entry(15, 0xEE);
    entry[7] = static_cast<std::uint8_t>(scramblingCode);
    entry[8] = static_cast<std::uint8_t>(scramblingCode >> 8 | setType << 5);
    return entry;
}

Bytes energies(std::uint32_t first, std::uint32_t second, std::uint32_t third)
{
    Bytes entry(32, 0xEE);
    for (const std::uint32_t ratio : {first, second, third}) {
        for (int shift = 0; shift < 32; shift += 8)
            entry.push_back(static_cast<std::uint8_t>(ratio >> shift));
    }
    return entry;
}

// 0x417A with this received power and these entries after a count of them.
Bytes searcherPacket(int power, std::uint8_t count, const std::vector<Bytes>& entries)
{
    Bytes bytes =
        packet(0x417A, {static_cast<std::uint8_t>(power), static_cast<std::uint8_t>(power >> 8), count});
    for (const Bytes& entry : entries)
        bytes.insert(bytes.end(), entry.begin(), entry.end());
    return bytes;
}

RowTexts activeCell(const char* scramblingCode, const char* rscp, const char* energy)
{
    return {{"Scrambling Code", scramblingCode}, {"RSCP", rscp}, {"Energy Per Chip", energy}};
}

TEST(ActiveSet, ListsTheCellsOfSetTypeZeroWithTheirOwnEnergies)
{
    SectionFixture<ActiveSet> fixture;
    const Bytes bytes = searcherPacket(-1000, 4,
        {cellEntry(1, 1), cellEntry(8191, 0), cellEntry(0x123, 0), cellEntry(4, 4), energies(1000, 0, 0),
            energies(0, 524287, 9), energies(66436, 1, 1), energies(0, 0, 0)});
    EXPECT_EQ(fixture.listAfter(bytes, 0x417A),
        (Rows{activeCell("8191", "-155 dB", "-1 dB"), activeCell("291", "-163 dB", "-9 dB")}))
        << "tenths are cut off toward zero: -1000 is -154 dBm";
    EXPECT_EQ(fixture.log.take(), Lines{"<4>ActiveSet"});

    const struct {
        int power;
        std::uint32_t ratios[3];
        RowTexts cell;
    } cases[] = {
        {-1, {0, 0, 706}, activeCell("7", "-86 dB", "-31 dB")},
        {-521, {0, 524288, 1}, activeCell("7", "-106 dB", "0 dB")},
        {32767, {1, 0, 0}, activeCell("7", "3221 dB", "0 dB")},
        {-32768, {0, 0, 0}, activeCell("7", "-3331 dB", "0 dB")},
    };
    for (const auto& [power, ratios, cell] : cases) {
        const Bytes one =
            searcherPacket(power, 1, {cellEntry(7, 0), energies(ratios[0], ratios[1], ratios[2])});
        EXPECT_EQ(fixture.listAfter(one, 0x417A), Rows{cell}) << power;
    }
}

TEST(ActiveSet, ShowsACellWhenBothItsEntriesFit)
{
    std::vector<Bytes> full(255, cellEntry(5, 0));
    full.insert(full.end(), 255, energies(1000, 0, 0));
    Bytes cutInEnergies =
        searcherPacket(0, 2, {cellEntry(5, 0), cellEntry(6, 0), energies(1, 1, 1), energies(1, 1, 1)});
    cutInEnergies.pop_back();
    const struct {
        const char* name;
        Bytes packet;
        std::size_t cells;
    } cases[] = {
        {"none", searcherPacket(0, 0, {cellEntry(5, 0), energies(1, 1, 1)}), 0},
        {"all that can be counted", searcherPacket(0, 255, full), 255},
        {"no energies at all", searcherPacket(0, 2, {cellEntry(5, 0), cellEntry(6, 0)}), 0},
        {"the second energies cut", cutInEnergies, 1},
    };
    SectionFixture<ActiveSet> fixture;
    for (const auto& [name, bytes, cells] : cases)
        EXPECT_EQ(fixture.listAfter(bytes, 0x417A).size(), cells) << name;
}

template <typename Section>
void expectAlwaysEmpty(const char* entryLine)
{
    SectionFixture<Section> fixture;
    for (const int count : {0, 2, 255}) {
        const Bytes bytes =
            searcherPacket(0, static_cast<std::uint8_t>(count), {cellEntry(1, 1), cellEntry(2, 2)});
        EXPECT_EQ(fixture.listAfter(bytes, 0x417A), Rows{}) << entryLine;
    }
    EXPECT_EQ(fixture.log.take(), Lines{entryLine});
}

TEST(CellsOutsideTheActiveSet, AreNeverListed)
{
    expectAlwaysEmpty<DetectedSet>("<4>DetectedSet");
    expectAlwaysEmpty<MonitoredSet>("<4>MonitoredSet");
    expectAlwaysEmpty<VirtualActiveSet>("<4>VirtualActiveSet");
}

// Two UMTS entries of 10 bytes, or GSM entries of 7 in the same bytes.
const Bytes kRanked = {0xE8, 0x29, 0xFF, 0x01, 0xB0, 0x9C, 0xFF, 0xF1, 0xFE, 0xFF, //
    0x00, 0x80, 0xFF, 0xFF, 0x7F, 0xFF, 0x7F, 0x80, 0x00, 0x80};

Bytes rankedPacket(std::uint8_t umts, std::uint8_t gsm, const Bytes& entries)
{
    Bytes bytes = packet(0x4005, {umts, gsm});
    bytes.insert(bytes.end(), entries.begin(), entries.end());
    return bytes;
}

TEST(UMTSSet, ListsRankedCells)
{
    SectionFixture<UMTSSet> fixture;
    EXPECT_EQ(fixture.listAfter(rankedPacket(2, 9, kRanked), 0x4005),
        (Rows{{{"Scrambling Code", "511"}, {"RSCP", "-101 dB"}, {"Energy Per Chip", "-7.500000 dB"},
                  {"Downlink Frequency", "10728"}, {"Ranking Value", "-2"}, {"Rank Cell RSCP", "-100 dB"}},
            {{"Scrambling Code", "65535"}, {"RSCP", "106 dB"}, {"Energy Per Chip", "-64.000000 dB"},
                {"Downlink Frequency", "-32768"}, {"Ranking Value", "-32768"},
                {"Rank Cell RSCP", "32767 dB"}}}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>UMTSSet"});
    EXPECT_EQ(fixture.listAfter(rankedPacket(0, 2, kRanked), 0x4005), Rows{});
    EXPECT_EQ(fixture.listAfter(rankedPacket(255, 0, Bytes(19, 1)), 0x4005).size(), 1U);
    EXPECT_EQ(fixture.listAfter(rankedPacket(255, 0, Bytes(2550, 1)), 0x4005).size(), 255U);
}

TEST(UMTSSet, ListsTheNeighborsOfTheCellMonitorList)
{
    SectionFixture<UMTSSet> fixture;
    const auto list = [&fixture](const std::string& cells) {
        return fixture.listAfter(cellList(cells), kExtraCodeCellMonitorList);
    };
    EXPECT_EQ(
        list(cell("UMTS", "Neighbor",
                 {{"UARFCN", 65536 + 10728}, {"ScramblingCode", -1}, {"RSCP", -101}, {"ECN0", 65536 - 9}})
            + cell("GSM", "Neighbor", {}) + cell("UMTS", "Serving", {}) + cell("UTRAN", "Neighbor", {})
            + cell(
                "UMTS", "Neighbor", {{"UARFCN", 1}, {"ScramblingCode", 2}, {"RSCP", 32767}, {"ECN0", 32767}})
            + cell("UMTS", "Neighbor", {})),
        (Rows{{{"UARFCN", "10728"}, {"Scrambling Code", "65535"}, {"RSCP", "-101 dBm"},
                  {"Energy Per Chip", "-9 dB"}},
            {{"UARFCN", "1"}, {"Scrambling Code", "2"}, {"RSCP", ""}, {"Energy Per Chip", ""}}, {}}));
    EXPECT_EQ(fixture.log.take(),
        (Lines{"<4>UMTSSet", "<3>UMTSSet: Failed to retrieve UARFCN\n",
            "<3>UMTSSet: Failed to retrieve Scrambling Code\n", "<3>UMTSSet: Failed to retrieve RSCP\n",
            "<3>UMTSSet: Failed to retrieve Energy Per Chip\n"}));
    EXPECT_EQ(fixture.listAfter(kNoCellList, kExtraCodeCellMonitorList), Rows{});
    EXPECT_EQ(fixture.log.take(), linesWithoutCellList("UMTSSet"));
}

TEST(GSMSet, ListsRankedCellsFromTheSameBytes)
{
    SectionFixture<GSMSet> fixture;
    EXPECT_EQ(fixture.listAfter(rankedPacket(2, 2, kRanked), 0x4005),
        (Rows{{{"ARFCN", "10728"}, {"BSIC", "511"}, {"RSSI", "-80 dBm"}, {"Ranking Value", "-100"}},
            {{"ARFCN", "65265"}, {"BSIC", "255"}, {"RSSI", "-128 dBm"}, {"Ranking Value", "-1"}}}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>GSMSet"});
    EXPECT_EQ(fixture.listAfter(rankedPacket(2, 0, kRanked), 0x4005), Rows{});
    EXPECT_EQ(fixture.listAfter(rankedPacket(0, 255, Bytes(13, 1)), 0x4005).size(), 1U);
    EXPECT_EQ(fixture.listAfter(rankedPacket(0, 255, Bytes(1785, 1)), 0x4005).size(), 255U);
}

TEST(CellSetReaders, RefuseAnIndexBeyondTheCount)
{
    const Bytes searcher = searcherPacket(0, 1, {cellEntry(1, 0), energies(1, 1, 1)});
    EXPECT_THROW(LogCode_0x417A(searcher).cells()[1], ArrayOutOfBoundsException);
    EXPECT_THROW(LogCode_0x417A(searcher).energies()[1], ArrayOutOfBoundsException);
    const Bytes ranked = rankedPacket(1, 1, kRanked);
    EXPECT_THROW(LogCode_0x4005(ranked).umtsCells()[1], ArrayOutOfBoundsException);
    EXPECT_THROW(LogCode_0x4005(ranked).gsmCells()[1], ArrayOutOfBoundsException);
}

} // namespace
} // namespace orvex::test
