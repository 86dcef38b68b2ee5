// The sections of the GSM side: serving cell, neighbours, GPRS options, radio resources.

#include "GSM/GPRSInformation.h"
#include "GSM/GSMRRInfo.h"
#include "GSM/GSMServingCell.h"
#include "GSM/MobileAllocation.h"
#include "GSM/NeighboringCells.h"

#include "ByteTexts.h"
#include "CellLists.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

// 0x5137 with these neighbour records.
Bytes surroundPacket(std::uint8_t count, const Bytes& records)
{
    Bytes bytes = packet(0x5137,
        {0xAA, 0xAA, 200, 0x02, 0x80, 0x01, 0x00, 0xFE, 0xFF, 0xFE, 0xFF, 0xAA, 0xAA, 2, 0xAA, count});
    bytes.insert(bytes.end(), records.begin(), records.end());
    return bytes;
}

TEST(GSMServingCell, ReadsEachFieldFromItsOwnBytes)
{
    SectionFixture<GSMServingCell> fixture;
    EXPECT_EQ(
        fixture.rowsAfter(packet(0x5134, {0x34, 0x12, 0x3F, 0x80, 0xFE, 0xFF, 0, 0, 0, 0, 0, 0, 0}), 0x5134),
        (RowTexts{{"Cell ID", "65534"}, {"ARFCN", "4660"}, {"BSIC", "32831"}}));
    EXPECT_EQ(fixture.rowsAfter(surroundPacket(0, {}), 0x5137),
        (RowTexts{{"RSSI", "200 dBm"}, {"C1 Value", "32770"}, {"C2 Value", "65534"}}))
        << "low 16 bits, without sign";
    EXPECT_EQ(fixture.rowsAfter(packet(0x5076, {0x23, 0x01, 0, 0}), 0x5076),
        (RowTexts{{"MA Dedicated ARFCN", "35"}}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>GSMServingCell"});
}

TEST(GSMServingCell, TakesTheFirstServingGSMCellOfTheList)
{
    SectionFixture<GSMServingCell> fixture;
    const auto rows = [&fixture](const std::string& cells) {
        return fixture.rowsAfter(cellList(cells), kExtraCodeCellMonitorList);
    };
    const std::string first = cell("GSM", "Serving", {{"CellID", -5}, {"ARFCN", 70000}});
    EXPECT_EQ(rows(cell("UMTS", "Serving", {{"CellID", 1}}) + cell("GSM", "Neighbor", {{"CellID", 2}}) + first
                  + cell("GSM", "Serving", {{"CellID", 3}, {"ARFCN", 4}})),
        (RowTexts{{"Cell ID", "-5"}, {"ARFCN", "70000"}}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>GSMServingCell"});

    EXPECT_EQ(rows(cell("GSM", "Serving", {{"ARFCN", 4}})), (RowTexts{{"ARFCN", "4"}}));
    EXPECT_EQ(
        fixture.log.take(), (Lines{"<4>GSMServingCell", "<3>GSMServingCell: Failed to retrieve Cell ID\n"}));
    EXPECT_EQ(rows(cell("GSM", "Serving", {{"CellID", 4}})), (RowTexts{{"Cell ID", "4"}}));
    EXPECT_EQ(
        fixture.log.take(), (Lines{"<4>GSMServingCell", "<3>GSMServingCell: Failed to retrieve ARFCN\n"}));
    EXPECT_EQ(rows(""), RowTexts{});
    EXPECT_EQ(fixture.log.take(), Lines{"<4>GSMServingCell"});
    EXPECT_EQ(fixture.rowsAfter(kNoCellList, kExtraCodeCellMonitorList), RowTexts{});
    EXPECT_EQ(fixture.log.take(), linesWithoutCellList("GSMServingCell"));
}

TEST(NeighboringCells, ListsNeighborsWithTheBSICThatIsKnownForTheirChannel)
{
    SectionFixture<NeighboringCells> fixture;
    const Bytes records = {0x34, 0x12, 90, 0xFF, 0xFF, 0xFF, 0xFF, 1, 2, 3, 4, 5, 6, 7, //
        0x0A, 0x00, 255, 0x04, 0x03, 0x02, 0x01, 0, 0, 0, 0, 0, 0, 0};
    const RowTexts first = {{"ARFCN", "4660"}, {"RSSI", "90"}, {"C1 Value", "-1"}};
    RowTexts second = {{"ARFCN", "10"}, {"RSSI", "255"}, {"C1 Value", "16909060"}};
    EXPECT_EQ(fixture.listAfter(surroundPacket(2, records), 0x5137), (std::vector<RowTexts>{first, second}));

    const std::vector<RowTexts> kept = {{{"", "stale"}}};
    const Bytes twoCodes = {0xAA, 2, 0x0A, 0x00, 5, 0xAA, 0x35, 0x12, 7, 0xAA};
    EXPECT_EQ(fixture.listAfter(packet(0x51FF, twoCodes), 0x51FF), kept) << "shows nothing by itself";
    second.emplace_back("BSIC", "5");
    EXPECT_EQ(fixture.listAfter(surroundPacket(2, records), 0x5137), (std::vector<RowTexts>{first, second}));

    second.pop_back();
    const Bytes none = {0xAA, 0};
    const Bytes cut = {0xAA, 1, 0x0A, 0x00, 63};
    for (const Bytes& codes : {none, cut}) {
        fixture.listAfter(packet(0x51FF, twoCodes), 0x51FF);
        fixture.listAfter(packet(0x51FF, codes), 0x51FF);
        EXPECT_EQ(
            fixture.listAfter(surroundPacket(2, records), 0x5137), (std::vector<RowTexts>{first, second}))
            << "a new map after each packet";
    }
}

TEST(NeighboringCells, ShowsTheRecordsThatFit)
{
    const Bytes three(42, 1);
    const struct {
        const char* name;
        Bytes packet;
        std::size_t records;
    } cases[] = {
        {"none", surroundPacket(0, three), 0},
        {"one of three", surroundPacket(1, three), 1},
        {"the last one cut in bytes that nobody reads", surroundPacket(3, Bytes(41, 1)), 2},
        {"all that is counted", surroundPacket(255, Bytes(3570, 1)), 255},
        {"none of those counted", surroundPacket(255, {}), 0},
    };
    SectionFixture<NeighboringCells> fixture;
    for (const auto& [name, bytes, records] : cases)
        EXPECT_EQ(fixture.listAfter(bytes, 0x5137).size(), records) << name;
}

TEST(NeighboringCells, ListsTheNeighborsOfTheCellMonitorList)
{
    SectionFixture<NeighboringCells> fixture;
    const auto list = [&fixture](const std::string& cells) {
        return fixture.listAfter(cellList(cells), kExtraCodeCellMonitorList);
    };
    EXPECT_EQ(list(cell("GSM", "Neighbor", {{"ARFCN", 65536 + 1023}, {"RSSI", -50}})
                  + cell("GSM", "Serving", {{"ARFCN", 1}}) + cell("UMTS", "Neighbor", {{"ARFCN", 2}})
                  + "<string>no cell</string>" + cell("GSM", "Neighbor", {{"ARFCN", -1}, {"RSSI", 32767}})
                  + cell("GSM", "Neighbor", {{"ARFCN", 3}, {"RSSI", 65535}}) + cell("GSM", "Neighbor", {})),
        (std::vector<RowTexts>{{{"ARFCN", "1023"}, {"RSSI", "-100 dBm"}}, {{"ARFCN", "65535"}, {"RSSI", ""}},
            {{"ARFCN", "3"}, {"RSSI", "-2 dBm"}}, {}}));
    EXPECT_EQ(fixture.log.take(),
        (Lines{"<4>NeighboringCells", "<3>NeighboringCells: Failed to retrieve ARFCN\n",
            "<3>NeighboringCells: Failed to retrieve RSSI\n"}));
    EXPECT_EQ(list(cell("GSM", "Serving", {})), std::vector<RowTexts>{});
    EXPECT_EQ(fixture.listAfter(kNoCellList, kExtraCodeCellMonitorList), std::vector<RowTexts>{});
    EXPECT_EQ(fixture.log.take(), linesWithoutCellList("NeighboringCells"));
}

TEST(GPRSInformation, ReadsEachFieldFromItsOwnBytes)
{
    const Bytes rest(30, 0xEE);
    const auto with = [&rest](LogCode code, Bytes payload) {
        payload.insert(payload.end(), rest.begin(), rest.end());
        return packet(code, payload);
    };
    Bytes psi = with(0x51FD, {1, 2, 3, 4});
    const struct {
        LogCode code;
        Bytes packet;
        RowTexts rows;
    } cases[] = {
        {0x51F5, with(0x51F5, {1, 3, 2}),
            {{"Network Control Order", "NC2"}, {"PFC Supported", "Supported"},
                {"Priority Access Threshold", "1 Only"}}},
        {0x51F6, with(0x51F6, {9, 9, 4, 63, 0}),
            {{"T3192", "80 ms"}, {"Access Burst Type", "8-bit format"}, {"DRX Timer Max", "63"}}},
        {0x51F6, with(0x51F6, {0, 0, 1, 0, 2}),
            {{"T3192", "1000 ms"}, {"Access Burst Type", "11-bit format"}, {"DRX Timer Max", "0"}}},
        {0x51FB, with(0x51FB, {255}), {{"PBCCH Present", "255"}}},
        {0x51FD, psi,
            {{"Ext Measurement Order", "4"}, {"Packet PSI Status", "1"}, {"Packet SI Status", "Supported"},
                {"Count LR", "2"}, {"Count HR", "3"}}},
        {0x5137, surroundPacket(0, {}), {{"Cell Reselect Hysteresis", "Applied"}}},
    };
    SectionFixture<GPRSInformation> fixture;
    for (const auto& [code, bytes, rows] : cases)
        EXPECT_EQ(fixture.rowsAfter(bytes, code), rows) << code;
    psi[33] = 0;
    EXPECT_EQ(textOf(fixture.rowsAfter(psi, 0x51FD), "Packet SI Status"), "Not Supported");
    Bytes surround = surroundPacket(0, {});
    surround[26] = 0;
    EXPECT_EQ(textOf(fixture.rowsAfter(surround, 0x5137), "Cell Reselect Hysteresis"), "Not Applied");
    for (const LogCode code : {0x51F7, 0x51F8, 0x51F9, 0x51FA, 0x51FC}) {
        EXPECT_EQ(fixture.rowsAfter(with(code, {}), code), RowTexts{});
        EXPECT_EQ(fixture.log.take(),
            (Lines{"<4>GPRSInformation", text("<3>Received an unknown log message: %d", code)}));
    }
}

TEST(GPRSInformation, NamesItsValues)
{
    using Section = GPRSInformation;
    expectTextsOfByte<Section>(
        0x7135, 13, "Network Operating Mode", {{0, "Class 1"}, {1, "Class 2"}, {2, "Class 3"}}, "Unknown");
    expectTextsOfByte<Section>(0x51F5, 15, "Network Control Order",
        {{0, "NC0"}, {1, "NC1"}, {2, "NC2"}, {255, "Not Available"}}, "Unknown");
    expectTextsOfByte<Section>(
        0x51F5, 13, "PFC Supported", {{0, "Not Supported"}, {1, "Supported"}, {255, "Available"}}, "Unknown");
    expectTextsOfByte<Section>(0x51F5, 14, "Priority Access Threshold",
        {{0, "Barred (PKT access not allowed in the Cell)"}, {1, "Barred"}, {2, "Barred"}, {3, "1 Only"},
            {4, "1 to 2"}, {5, "1 to 3"}, {6, "1 to 4"}, {7, "Allowed"}, {255, "Not Available"}},
        "Unknown");
    expectTextsOfByte<Section>(0x51F6, 15, "T3192",
        {{0, "500 ms"}, {1, "1000 ms"}, {2, "1500 ms"}, {3, "0 ms"}, {4, "80 ms"}, {5, "120 ms"},
            {6, "160 ms"}, {7, "200 ms"}},
        "?? ms");
    expectTextsOfByte<Section>(0x51F4, 14, "SI13 Position",
        {{0, "Located on BCCH"}, {1, "Located on Extended BCCH"}, {255, "Not Available"}}, "Unknown");
}

TEST(GSMRRInfo, ReadsEachFieldFromItsOwnBytes)
{
    const Bytes ten(10, 0);
    Bytes dtx = packet(0x5072, ten);
    dtx[19] = 2;
    Bytes drx = packet(0x51F6, Bytes(11, 0xEE));
    drx[16] = 7;
    const struct {
        LogCode code;
        Bytes packet;
        RowTexts rows;
    } cases[] = {
        {0x512C, packet(0x512C, {5, 6, 7, 8}),
            {{"RR State", "RR_IDLE"}, {"RR Sub State", "6"}, {"RR Status", "7"}, {"RR Mode", "Data"}}},
        {0x512C, packet(0x512C, {20, 255, 254, 0}),
            {{"RR State", "RR_CELL_REEST"}, {"RR Sub State", "255"}, {"RR Status", "254"},
                {"RR Mode", "Voice"}}},
        {0x5137, surroundPacket(0, {}),
            {{"Serving Rx Level", "200"}, {"Rx Quality Full", "98306"}, {"Rx Quality Sub", "-65538"}}},
        {0x5072, dtx, {{"DTX Used", "ON"}}},
        {0x5072, packet(0x5072, ten), {{"DTX Used", "OFF"}}},
        {0x51F6, drx, {{"DRX Used", "7 sec"}}},
    };
    SectionFixture<GSMRRInfo> fixture;
    for (const auto& [code, bytes, rows] : cases)
        EXPECT_EQ(fixture.rowsAfter(bytes, code), rows) << code;
    expectTextsOfByte<GSMRRInfo>(0x512C, 13, "RR State",
        {{0, "RR_INACTIVE"}, {1, "RR_GOING_ACTIVE"}, {2, "RR_GOING_INACTIVE"}, {3, "RR_CELL_SELECTION"},
            {4, "RR_PLMN_LIST_CONSTRUCTION"}, {5, "RR_IDLE"}, {6, "RR_CELL_RESELECTION"},
            {7, "RR_CONNECTION_PENDING"}, {8, "RR_CHOOSE_CELL"}, {9, "RR_DATA_TRANSFER"},
            {10, "RR_NO_CHANNELS"}, {11, "RR_CONNECTION_RELEASE"}, {12, "RR_EARLY_CAMPED_WAIT_FOR_SI"},
            {13, "RR_W2G_INTERRAT_HANDOVER_ PROGRESS"}, {14, "RR_W2G_INTERRAT_RESELECTION_PROGRESS"},
            {15, "RR_WAIT_FOR_EARLY_PSCAN"}, {16, "GRR51"}, {17, "GRR52"},
            {18, "RR_G2W_INTERRAT_RESELECTION_PROGRESS"}, {19, "RR_G2W_INTERRAT_HANDOVER_ PROGRESS"},
            {20, "RR_CELL_REEST"}, {21, "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS"}},
        "Unknown");
}

TEST(MobileAllocation, ListsTheChannelsThatFit)
{
    SectionFixture<MobileAllocation> fixture;
    const struct {
        const char* name;
        Bytes payload;
        RowTexts rows;
    } cases[] = {
        {"two", {63, 2, 0x34, 0x12, 0xFF, 0xFF}, {{"HSN", "63"}, {"ARFCNs", "[4660, 65535]"}}},
        {"none", {0, 0, 0x34, 0x12}, {{"HSN", "0"}, {"ARFCNs", "[]"}}},
        {"more than fit", {1, 255, 0x34, 0x12, 0xFF}, {{"HSN", "1"}, {"ARFCNs", "[4660]"}}},
    };
    for (const auto& [name, payload, rows] : cases)
        EXPECT_EQ(fixture.rowsAfter(packet(0x51F8, payload), 0x51F8), rows) << name;
    const Bytes one = packet(0x51F8, {0, 1, 0, 0});
    EXPECT_THROW(LogCode_0x51F8(one).channels()[1], ArrayOutOfBoundsException);
}

} // namespace
} // namespace orvex::test
