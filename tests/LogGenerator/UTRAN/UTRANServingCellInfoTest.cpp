#include "UTRAN/UTRANServingCellInfo.h"

#include "CellMonitorList.h"
#include "LogPackets.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

using Fixture = SectionFixture<UTRANServingCellInfo>;
using Lines = std::vector<std::string>;

constexpr const char* kEntryLine = "<4>Serving Cell Info";

TEST(UTRANServingCellInfo, ReadsEachFieldOf0xD0E2FromItsOwnBytes)
{
    Bytes payload = {0xAA, 0x07, 0x09, 0xAA, 0x01, 0x02, 0x03, 0x04, 0x78, 0x56, 0x34, 0x12, 0x03};
    Fixture fixture;
    EXPECT_EQ(fixture.rowsAfter(packet(0xD0E2, payload), 0xD0E2),
        (RowTexts{{"Cell Access Restrictions", "7"}, {"Cell ID", "305419896"}, {"Downlink UARFCN", "1027"},
            {"Uplink UARFCN", "513"}, {"URA ID", "9"}, {"Allowed Access", "Emergency Calls Only"}}));
    EXPECT_EQ(fixture.log.take(), Lines{kEntryLine});

    std::fill_n(payload.begin() + 8, 4, 0xFF);
    payload[12] = 0x02;
    const RowTexts rows = fixture.rowsAfter(packet(0xD0E2, payload), 0xD0E2);
    EXPECT_EQ(textOf(rows, "Cell ID"), "-1");
    EXPECT_EQ(textOf(rows, "Allowed Access"), "All Calls");
}

std::string record(const char* radio, const char* type, const char* numbers)
{
    return text("<dict><key>RadioAccessTechnology</key><string>%s</string>"
                "<key>CellType</key><string>%s</string>%s</dict>",
        radio, type, numbers);
}

constexpr const char* kFirst =
    "<key>LAC</key><integer>1</integer><key>CellID</key><integer>2</integer>"
    "<key>BandInfo</key><integer>3</integer><key>ScramblingCode</key><integer>4</integer>"
    "<key>UARFCN</key><integer>10054</integer>";
constexpr const char* kSecond =
    "<key>LAC</key><integer>5</integer><key>ScramblingCode</key><integer>6</integer>";

TEST(UTRANServingCellInfo, AppliesEveryServingCellOfTheCellMonitorList)
{
    Fixture fixture;
    const std::string list = "<array>" + record("UTRAN", "Serving", kFirst)
        + record("UTRAN", "Neighbor", kSecond) + record("UMTS", "Serving", kSecond) + "</array>";
    const RowTexts expected = {{"Local Area Code", "1"}, {"Cell ID", "2"}, {"Freq Band Indicator", "3"},
        {"Cell Scrambling Code", "4"}, {"Uplink UARFCN", "10054"}, {"Downlink UARFCN", "10054"}};
    EXPECT_EQ(fixture.rowsAfter(propertyListPacket(0xFF0001, list), 0xFF0001), expected);
    EXPECT_EQ(fixture.log.take(), Lines{kEntryLine});

    const std::string two =
        "<array>" + record("UTRAN", "Serving", kFirst) + record("UTRAN", "Serving", kSecond) + "</array>";
    RowTexts later = expected;
    later[0].second = "5";
    later[3].second = "6";
    EXPECT_EQ(fixture.rowsAfter(propertyListPacket(0xFF0001, two), 0xFF0001), later);
    EXPECT_EQ(fixture.log.take(),
        (Lines{kEntryLine, "<3>Serving Cell Info: Failed to retrieve Cell ID\n",
            "<3>Serving Cell Info: Failed to retrieve Freq Band Indicator\n",
            "<3>Serving Cell Info: Failed to retrieve UARFCN\n"}));
}

TEST(UTRANServingCellInfo, SaysWhichEntryOfTheServingCellIsNoNumber)
{
    Fixture fixture;
    const std::string list = "<array>" + record("UTRAN", "Serving", "") + "</array>";
    EXPECT_EQ(fixture.rowsAfter(propertyListPacket(0xFF0001, list), 0xFF0001), RowTexts{});
    EXPECT_EQ(fixture.log.take(),
        (Lines{kEntryLine, "<3>Serving Cell Info: Failed to retrieve LAC\n",
            "<3>Serving Cell Info: Failed to retrieve Cell ID\n",
            "<3>Serving Cell Info: Failed to retrieve Freq Band Indicator\n",
            "<3>Serving Cell Info: Failed to retrieve Cell Scrambling Code\n",
            "<3>Serving Cell Info: Failed to retrieve UARFCN\n"}));
}

TEST(UTRANServingCellInfo, ListThatIsNoPropertyListChangesNothingAndAnotherKindIsFatal)
{
    Fixture fixture;
    EXPECT_EQ(fixture.rowsAfter(packet(0xFF0001, {'n', 'o'}), 0xFF0001), RowTexts{});
    EXPECT_EQ(fixture.log.take(), (Lines{kEntryLine, "<3>Cell Info Array data could not be constructed"}));
    EXPECT_THROW(fixture.rowsAfter(propertyListPacket(0xFF0001, "<string>x</string>"), 0xFF0001),
        CellMonitorList::WrongKindException);
}

} // namespace
} // namespace orvex::test
