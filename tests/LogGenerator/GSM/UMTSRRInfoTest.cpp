// WCDMA radio resources and throughput: serving cell, transmit power, block errors, HARQ processes.

#include "GSM/UMTSRRInfo.h"
#include "GSM/BLER.h"
#include "GSM/HSDPAInformation.h"

#include "ByteTexts.h"
#include "CellLists.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

TEST(UMTSRRInfo, ReadsEachFieldFromItsOwnBytes)
{
    const Bytes cell = {0x04, 0x03, 0x02, 0x01, 0xE8, 0x29, 1, 0, 0xFF, 0xFF, 0xFF, 0xFF, 0x34, 0x92, 1, 0};
    const struct {
        LogCode code;
        Bytes payload;
        RowTexts rows;
    } cases[] = {
        {0x4125, {3}, {{"RRC State", "CELL_DCH"}}},
        {0x4127, cell,
            {{"Cell ID", "-1"}, {"Downlink Frequency", "76264"}, {"Uplink Frequency", "16909060"},
                {"URA ID", "37428"}}},
        {0x4157, {2, 0, 0, 0, 0, 0}, {{"Ciphering", "Enabled"}}},
        {0x4157, {0, 1, 1, 1, 1, 1}, {{"Ciphering", "Disabled"}}},
    };
    SectionFixture<UMTSRRInfo> fixture;
    for (const auto& [code, payload, rows] : cases)
        EXPECT_EQ(fixture.rowsAfter(packet(code, payload), code), rows) << code;
    expectTextsOfByte<UMTSRRInfo>(0x4125, 13, "RRC State",
        {{0, "Disconnected"}, {1, "Connecting"}, {2, "CELL_FACH"}, {3, "CELL_DCH"}, {4, "CELL_PCH"},
            {5, "URA_PCH"}},
        "Unknown");
}

// 0x4031 with an entry for each power, as the packet holds it, and a count of its own.
Bytes powerPacket(std::uint8_t count, const std::vector<int>& powers)
{
    Bytes bytes = packet(0x4031, {0xEE, count, 0xEE});
    for (const int power : powers) {
        Bytes entry(14, 0xEE);
        entry[4] = static_cast<std::uint8_t>(power);
        entry[5] = static_cast<std::uint8_t>(power >> 8);
        bytes.insert(bytes.end(), entry.begin(), entry.end());
    }
    return bytes;
}

TEST(UMTSRRInfo, AveragesTransmitPower)
{
    Bytes cut = powerPacket(2, {100, 500});
    cut.pop_back();
    const struct {
        const char* name;
        Bytes packet;
        const char* text;
    } cases[] = {
        {"entries without a value do not count", powerPacket(3, {-1000, 0, -500}), "-93.50 dBm"},
        {"one", powerPacket(1, {233, 5000}), "4.00 dBm"},
        {"cut off toward zero", powerPacket(3, {-521, -522, -512}), "-70.33 dBm"},
        {"the ends", powerPacket(2, {32767, -32768}), "-19.00 dBm"},
        {"none", powerPacket(0, {100}), " nan dBm"},
        {"none with a value", powerPacket(2, {0, 0}), " nan dBm"},
        {"the last one cut", cut, "-9.00 dBm"},
        {"all that can be counted", powerPacket(255, std::vector<int>(255, 100)), "-9.00 dBm"},
    };
    SectionFixture<UMTSRRInfo> fixture;
    for (const auto& [name, bytes, text] : cases)
        EXPECT_EQ(fixture.rowsAfter(bytes, 0x4031), (RowTexts{{"Transmit Power", text}})) << name;
    const Bytes one = powerPacket(1, {1});
    EXPECT_THROW(LogCode_0x4031(one).entries()[1], ArrayOutOfBoundsException);
}

TEST(UMTSRRInfo, TakesTheServingCellOfTheListUntilTheNextServingCellPacket)
{
    SectionFixture<UMTSRRInfo> fixture;
    const auto bound = Dictionary::make();
    fixture.section.updateSectionRef(bound);
    fixture.section.updateWithData(
        cellList(cell("GSM", "Serving", {{"CellID", 1}}) + cell("UMTS", "Neighbor", {{"CellID", 2}})
            + cell("UMTS", "Serving", {{"CellID", 65539}, {"UARFCN", 76264}, {"ScramblingCode", 66047}})
            + cell("UMTS", "Serving", {{"CellID", 4}})),
        kExtraCodeCellMonitorList);
    EXPECT_EQ(
        rowsOf(bound), (RowTexts{{"Cell ID", "65539"}, {"UARFCN", "76264"}, {"Scrambling Code", "66047"}}));
    fixture.section.updateWithData(packet(0x4127, Bytes(16, 0)), 0x4127);
    EXPECT_EQ(rowsOf(bound),
        (RowTexts{{"Cell ID", "0"}, {"Scrambling Code", "66047"}, {"Downlink Frequency", "0"},
            {"Uplink Frequency", "0"}, {"URA ID", "0"}}));

    EXPECT_EQ(
        fixture.rowsAfter(cellList(cell("UMTS", "Serving", {})), kExtraCodeCellMonitorList), RowTexts{});
    EXPECT_EQ(fixture.log.take(),
        (Lines{"<4>UMTSRRInfo", "<3>UMTSRRInfo: Failed to retrieve Cell ID\n",
            "<3>UMTSRRInfo: Failed to retrieve UARFCN\n",
            "<3>UMTSRRInfo: Failed to retrieve Scrambling Code\n"}));
    EXPECT_EQ(fixture.rowsAfter(kNoCellList, kExtraCodeCellMonitorList), RowTexts{});
    EXPECT_EQ(fixture.log.take(), linesWithoutCellList("UMTSRRInfo"));
}

// The rows of the records of one list row, one text a record.
std::vector<RowTexts> recordsOf(const Dictionary& rows, const char* name)
{
    std::vector<RowTexts> result;
    if (const auto list = rows[name].array()) {
        for (const Value& record : *list)
            result.push_back(rowsOf(record.dictionary()));
    }
    return result;
}

TEST(BLER, ListsTheTransportChannelsThatFit)
{
    SectionFixture<BLER> fixture;
    const auto bound = Dictionary::make();
    fixture.section.updateSectionRef(bound);
    Bytes bytes = packet(0x4116,
        {2, 0x34, 0x92, 7, 1, 2, 3, 4, 0xFF, 0xFF, 0xFF, 0xFF, 8, 0, 0, 0, 0x80, 0xFF, 0xFF, 0xFF, 0x7F});
    const RowTexts first = {
        {"Transport Channel ID", "7"}, {"CRC Received", "67305985"}, {"CRC Received in Error", "-1"}};
    const RowTexts second = {{"Transport Channel ID", "8"}, {"CRC Received", "-2147483648"},
        {"CRC Received in Error", "2147483647"}};
    fixture.section.updateWithData(bytes, 0x4116);
    EXPECT_EQ(textOf((*bound)["Window Size"]), "37428");
    EXPECT_EQ(recordsOf(*bound, "Transport Channels"), (std::vector<RowTexts>{first, second}));
    EXPECT_EQ(fixture.log.take().back(), "<4>BLER");

    bytes.pop_back();
    fixture.section.updateWithData(bytes, 0x4116);
    EXPECT_EQ(recordsOf(*bound, "Transport Channels"), std::vector<RowTexts>{first});
    EXPECT_THROW(LogCode_0x4116(bytes).transportChannels()[2], ArrayOutOfBoundsException);
    bytes[13] = 0;
    fixture.section.updateWithData(bytes, 0x4116);
    EXPECT_EQ(textOf((*bound)["Transport Channels"]), "[]");
}

// A HARQ record of 9 bytes whose fields are all different.
Bytes process(std::uint8_t identity)
{
    return {identity, 0xFE, 0xFF, 0xFF, 0xFF, 0x02, identity, 0xFF, 0xFF};
}

RowTexts rowsOfProcess(int identity)
{
    return {{"Process ID", std::to_string(identity)}, {"No Rx Bits", "4294967294"},
        {"New Tx", std::to_string(identity * 256 + 2)}, {"Block Errors", "65535"}};
}

// 0x4221 with its processes in their places.
Bytes harqPacket(std::uint8_t carriers, const std::vector<std::uint8_t>& primary,
    const std::vector<std::uint8_t>& secondary)
{
    Bytes bytes = packet(0x4221,
        {9, 0x21, carriers, static_cast<std::uint8_t>(primary.size()),
            static_cast<std::uint8_t>(secondary.size())});
    const auto append = [&bytes](
                            const Bytes& record) { bytes.insert(bytes.end(), record.begin(), record.end()); };
    for (const std::uint8_t identity : primary)
        append(process(identity));
    if (!secondary.empty())
        bytes.resize(18 + 162 * primary.size(), 0xEE);
    for (const std::uint8_t identity : secondary)
        append(process(identity));
    return bytes;
}

TEST(HSDPAInformation, ReadsProcessesOfBothCarriersFromTheirPlaces)
{
    SectionFixture<HSDPAInformation> fixture;
    const auto bound = Dictionary::make();
    fixture.section.updateSectionRef(bound);
    const auto update = [&](const Bytes& bytes) { fixture.section.updateWithData(bytes, 0x4221); };
    using Records = std::vector<RowTexts>;

    const Bytes both = harqPacket(0x0B, {1, 2}, {3, 4});
    ASSERT_EQ(both.size(), 18U + 324 + 18);
    update(both);
    EXPECT_EQ(rowsOf(bound),
        (RowTexts{{"Version", "9"}, {"Sub Frames", "801"}, {"Carrier Info", "Dual Carrier"},
            {"Primary HARQ Process", textOf((*bound)["Primary HARQ Process"])},
            {"Secondary HARQ Process", textOf((*bound)["Secondary HARQ Process"])}}));
    EXPECT_EQ(recordsOf(*bound, "Primary HARQ Process"), (Records{rowsOfProcess(1), rowsOfProcess(2)}));
    EXPECT_EQ(recordsOf(*bound, "Secondary HARQ Process"), (Records{rowsOfProcess(3), rowsOfProcess(4)}));

    update(harqPacket(0x0C, std::vector<std::uint8_t>(255, 1), {}));
    EXPECT_EQ(textOf((*bound)["Carrier Info"]), "Reserved");
    EXPECT_EQ(recordsOf(*bound, "Primary HARQ Process").size(), 255U);
    EXPECT_EQ(recordsOf(*bound, "Secondary HARQ Process").size(), 2U) << "the list it had";

    update(harqPacket(0x04, {}, {5}));
    EXPECT_EQ(textOf((*bound)["Carrier Info"]), "MIMO");
    EXPECT_EQ(textOf((*bound)["Sub Frames"]), "33");
    EXPECT_EQ(recordsOf(*bound, "Primary HARQ Process").size(), 255U) << "the list it had";
    EXPECT_EQ(recordsOf(*bound, "Secondary HARQ Process"), Records{rowsOfProcess(5)});

    Bytes cut = harqPacket(0xF0, {6, 7}, {8});
    cut.pop_back();
    update(cut);
    EXPECT_EQ(textOf((*bound)["Carrier Info"]), "Single Carrier");
    EXPECT_EQ(recordsOf(*bound, "Primary HARQ Process"), (Records{rowsOfProcess(6), rowsOfProcess(7)}));
    EXPECT_EQ(recordsOf(*bound, "Secondary HARQ Process"), Records{});
    cut.resize(18);
    update(cut);
    EXPECT_EQ(recordsOf(*bound, "Primary HARQ Process"), Records{});

    EXPECT_THROW(LogCode_0x4221(both).primaryProcesses()[2], ArrayOutOfBoundsException);
    EXPECT_THROW(LogCode_0x4221(both).secondaryProcesses()[2], ArrayOutOfBoundsException);
}

} // namespace
} // namespace orvex::test
