#include "LTE/LTEServingCellInfo.h"

#include "CellMonitorList.h"
#include "LogPackets.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

using Fixture = SectionFixture<LTEServingCellInfo>;
using Lines = std::vector<std::string>;

constexpr const char* kEntryLine = "<4>LTE Serving Cell Info";

Bytes servingCellPayload(std::uint8_t downlinkBlocks = 6, std::uint8_t uplinkBlocks = 100)
{
    return {0xAA, 0x01, 0x01, 0x02, 0x03, 0x52, 0x4C, downlinkBlocks, uplinkBlocks, 0x78, 0x56, 0x34, 0x12,
        0xCD, 0xAB, 0x07, 0x00, 0x01, 0x00, 0xBB, 0xBB, 0xBB, 0xBB, 0xBB, 0xBB};
}

TEST(LTEServingCellInfo, ReadsEachFieldOf0xB0C2FromItsOwnBytes)
{
    Fixture fixture;
    const RowTexts expected = {{"Physical Cell ID", "257"}, {"Download Frequency", "770"},
        {"Upload Frequency", "19538"}, {"Download Bandwidth", "1.4 MHz"}, {"Upload Bandwidth", "20 MHz"},
        {"Cell Identity", "305419896"}, {"Tracking Area Code", "43981"}, {"Freq Band Indicator", "65543"}};
    EXPECT_EQ(fixture.rowsAfter(packet(0xB0C2, servingCellPayload()), 0xB0C2), expected);
    EXPECT_EQ(fixture.log.take(), Lines{kEntryLine});

    Bytes cut = packet(0xB0C2, servingCellPayload());
    cut.pop_back();
    EXPECT_EQ(fixture.rowsAfter(cut, 0xB0C2), RowTexts{});
    EXPECT_EQ(fixture.log.take(), Lines{kEntryLine});
}

TEST(LTEServingCellInfo, NamesBandwidthsAndShowsIdentitiesSigned)
{
    const struct {
        std::uint8_t blocks;
        const char* text;
    } cases[] = {{0, "Unknown"}, {5, "Unknown"}, {6, "1.4 MHz"}, {7, "Unknown"}, {15, "3 MHz"}, {25, "5 MHz"},
        {50, "10 MHz"}, {75, "15 MHz"}, {100, "20 MHz"}, {255, "Unknown"}};
    Fixture fixture;
    for (const auto& [blocks, expected] : cases) {
        Bytes payload = servingCellPayload(blocks, blocks);
        std::fill_n(payload.begin() + 9, 4, 0xFF);
        const RowTexts rows = fixture.rowsAfter(packet(0xB0C2, payload), 0xB0C2);
        ASSERT_EQ(rows.size(), 8U);
        EXPECT_EQ(rows[3].second, expected) << int{blocks};
        EXPECT_EQ(rows[4].second, expected) << int{blocks};
        EXPECT_EQ(rows[5].second, "-1");
    }
}

TEST(LTEServingCellInfo, ReportsEveryAntennaPacketAlthoughItIsDecoded)
{
    Fixture fixture;
    const Bytes payload = {0, 1, 2, 3, 9, 5, 6, 4, 8};
    EXPECT_EQ(fixture.rowsAfter(packet(0xB0C1, payload), 0xB0C1), (RowTexts{{"Num Tx Antennas", "4"}}));
    EXPECT_EQ(fixture.log.take(), (Lines{kEntryLine, "<3>Received an unknown log message: 45249"}));

    EXPECT_EQ(fixture.rowsAfter(packet(0xB0C1, Bytes(8)), 0xB0C1), RowTexts{}) << "one byte short";
    EXPECT_EQ(fixture.log.take(), Lines{kEntryLine});
    fixture.rowsAfter(packet(0xB0C3, Bytes(40)), 0xB0C3);
    EXPECT_EQ(fixture.log.take(), (Lines{kEntryLine, "<3>Received an unknown log message: 45251"}));
}

constexpr const char* kServingLTE =
    "<key>RadioAccessTechnology</key><string>LTE</string><key>CellType</key><string>Serving</string>";

std::string cellList(std::initializer_list<std::string> records)
{
    std::string result = "<array>";
    for (const std::string& record : records)
        result += "<dict>" + record + "</dict>";
    return result + "</array>";
}

std::string number(const char* key, const char* value)
{
    return std::string("<key>") + key + "</key><integer>" + value + "</integer>";
}

TEST(LTEServingCellInfo, TakesTheFirstServingLTECellOfTheCellMonitorList)
{
    const std::string serving = kServingLTE + number("TAC", "4660") + number("CellID", "-7")
        + number("PhysicalCellID", "503") + number("BandInfo", "20") + number("UARFCN", "6300");
    const std::string neighbor = "<key>RadioAccessTechnology</key><string>LTE</string><key>CellType</key>"
                                 "<string>Neighbor</string>"
        + number("TAC", "1");
    const std::string otherTechnology =
        "<key>RadioAccessTechnology</key><string>GSM</string><key>CellType</key>"
        "<string>Serving</string>"
        + number("TAC", "2");
    const std::string second = kServingLTE + number("TAC", "3");
    const RowTexts expected = {{"Tracking Area Code", "4660"}, {"Cell Identity", "-7"},
        {"Physical Cell ID", "503"}, {"Freq Band Indicator", "20"}, {"UARFCN", "6300"}};
    const struct {
        const char* name;
        std::string list;
        RowTexts rows;
    } cases[] = {
        {"only it", cellList({serving}), expected},
        {"others before it", cellList({neighbor, otherTechnology, "", serving, second}), expected},
        {"an element that is no record", "<array><string>x</string><dict>" + serving + "</dict></array>",
            expected},
        {"no cell", "<array/>", {}},
        {"no serving LTE cell", cellList({neighbor, otherTechnology}), {}},
    };
    Fixture fixture;
    for (const auto& [name, list, rows] : cases) {
        EXPECT_EQ(fixture.rowsAfter(propertyListPacket(0xFF0001, list), 0xFF0001), rows) << name;
        EXPECT_EQ(fixture.log.take(), Lines{kEntryLine}) << name;
    }
}

TEST(LTEServingCellInfo, SaysWhichEntryOfTheServingCellIsNoNumber)
{
    const std::string record = kServingLTE + number("TAC", "2147483647") + number("CellID", "2147483648")
        + "<key>PhysicalCellID</key><real>5</real><key>BandInfo</key><true/><key>UARFCN</key><string>7</"
          "string>";
    Fixture fixture;
    EXPECT_EQ(fixture.rowsAfter(propertyListPacket(0xFF0001, cellList({record})), 0xFF0001),
        (RowTexts{{"Tracking Area Code", "2147483647"}}));
    EXPECT_EQ(fixture.log.take(),
        (Lines{kEntryLine, "<3>Serving Cell Info: Failed to retrieve Cell ID\n",
            "<3>Serving Cell Info: Failed to retrieve Physical Cell ID\n",
            "<3>Serving Cell Info: Failed to retrieve Freq Band Indicator\n",
            "<3>Serving Cell Info: Failed to retrieve UARFCN\n"}));

    fixture.rowsAfter(propertyListPacket(0xFF0001, cellList({kServingLTE})), 0xFF0001);
    EXPECT_EQ(fixture.log.take()[1], "<3>Serving Cell Info: Failed to retrieve TAC\n");
}

TEST(LTEServingCellInfo, ListThatIsNoPropertyListChangesNothingAndAnotherKindIsFatal)
{
    Fixture fixture;
    EXPECT_EQ(fixture.rowsAfter(packet(0xFF0001, {'n', 'o'}), 0xFF0001), RowTexts{});
    EXPECT_EQ(fixture.log.take(),
        (Lines{kEntryLine, "<3>Cell Info Array data could not be constructed",
            "<3>Failed to get Cell Array\n"}));
    EXPECT_THROW(fixture.rowsAfter(propertyListPacket(0xFF0001, "<dict/>"), 0xFF0001),
        CellMonitorList::WrongKindException);
}

TEST(LTEServingCellInfo, ServingCellPacketDropsTheUARFCNOfTheCellMonitorList)
{
    Fixture fixture;
    const auto rows = Dictionary::make();
    fixture.section.updateSectionRef(rows);
    const Bytes list =
        propertyListPacket(0xFF0001, cellList({kServingLTE + number("UARFCN", "6300") + number("TAC", "1")}));
    fixture.section.updateWithData(list, 0xFF0001);
    EXPECT_EQ((*rows)["UARFCN"], Value("6300"));
    EXPECT_EQ((*rows)["Tracking Area Code"], Value("1"));
    fixture.section.updateWithData(packet(0xB0C2, servingCellPayload()), 0xB0C2);
    EXPECT_FALSE(rows->contains("UARFCN"));
    EXPECT_EQ((*rows)["Tracking Area Code"], Value("43981"));
}

} // namespace
} // namespace orvex::test
