// The sections of the WCDMA side: cell sets, radio resources, throughput.

#include "GSM/MRL_GSMLogGenerator.h"

#include "SectionCases.h"

namespace orvex::test {
namespace {

constexpr const char* kNoList = "Cell Info Array data could not be constructedFailed to get Cell Array\n";

TEST(WCDMASections, ActiveSet)
{
    const char* name = "Active Set";
    // One cell of scrambling code 7 with these energies at this received power.
    const auto cell = [](const char* power, const char* energies) {
        return text("417A: %s 01 @23 0700 @63 %s", power, energies);
    };
    expectShown<MRL_GSMClassIndex>({
        // Cells of set type 0, with their own energies. Tenths are cut off toward zero: -1000 is -154 dBm.
        {name,
            "417A: 18FC 04 @23 0120 @38 FF1F @53 2301 @68 0480 "
            "@108 E8030000 00*8 @152 00000000 FFFF0700 09000000 @196 84030100 01000000 01000000 @240 00*12",
            "Scrambling Code=8191, RSCP=-155 dB, Energy Per Chip=-1 dB | "
            "Scrambling Code=291, RSCP=-163 dB, Energy Per Chip=-9 dB"},
        {name, cell("F7FD", "00*4 00000800 01000000"),
            "Scrambling Code=7, RSCP=-106 dB, Energy Per Chip=0 dB"},
        {name, cell("0080", "00*12"), "Scrambling Code=7, RSCP=-3331 dB, Energy Per Chip=0 dB"},
        // A cell is shown when both its entries fit.
        {name, "417A: 0000 FF 00*15045", "#255"},
        {name, "417A: 0000 02 00*118", "#2"},
        {"Detected Set", "417A: 0000 02 20*30 00*88", "(empty)"},
        {"Monitored Set", "417A: 0000 02 20*30 00*88", "(empty)"},
        {"Virtual Active Set", "417A: 0000 02 20*30 00*88", "(empty)"},
    });
}

TEST(WCDMASections, RankedCells)
{
    // Two UMTS entries of 10 bytes, or GSM entries of 7 in the same bytes.
    const std::string entries = "E829 FF01 B0 9C FF F1 FEFF 0080 FFFF 7F FF 7F 80 0080";
    const char* umts = "UMTS Set";
    const char* gsm = "GSM Set";
    expectShown<MRL_GSMClassIndex>({
        {umts, "4005: 02 09 " + entries,
            "Scrambling Code=511, RSCP=-101 dB, Energy Per Chip=-7.500000 dB, Downlink Frequency=10728, "
            "Ranking Value=-2, Rank Cell RSCP=-100 dB | "
            "Scrambling Code=65535, RSCP=106 dB, Energy Per Chip=-64.000000 dB, Downlink Frequency=-32768, "
            "Ranking Value=-32768, Rank Cell RSCP=32767 dB"},
        {umts, "4005: FF 00 01*2550", "#255"},
        {gsm, "4005: 02 02 " + entries,
            "ARFCN=10728, BSIC=511, RSSI=-80 dBm, Ranking Value=-100 | "
            "ARFCN=65265, BSIC=255, RSSI=-128 dBm, Ranking Value=-1"},
        {gsm, "4005: 00 FF 01*1785", "#255"},
        {umts,
            "FF0001: UMTS Neighbor UARFCN=76264 ScramblingCode=-1 RSCP=-101 ECN0=65527, GSM Neighbor,"
            "UMTS Serving, UTRAN Neighbor, UMTS Neighbor UARFCN=1 ScramblingCode=2 RSCP=32767 ECN0=32767,"
            "UMTS Neighbor",
            "UARFCN=10728, Scrambling Code=65535, RSCP=-101 dBm, Energy Per Chip=-9 dB | "
            "UARFCN=1, Scrambling Code=2, RSCP=, Energy Per Chip= | ",
            "UMTSSet: Failed to retrieve UARFCN\nUMTSSet: Failed to retrieve Scrambling Code\n"
            "UMTSSet: Failed to retrieve RSCP\nUMTSSet: Failed to retrieve Energy Per Chip\n"},
        {umts, "FF0001: no list", "(empty)", kNoList},
    });
}

TEST(WCDMASections, RadioResources)
{
    const char* name = "UMTS RR Info";
    const char* cell = "FF0001: GSM Serving CellID=1, UMTS Neighbor CellID=2,"
                       "UMTS Serving CellID=65539 UARFCN=76264 ScramblingCode=66047, UMTS Serving CellID=4";
    expectShown<MRL_GSMClassIndex>({
        {name, "4127: 04030201 E8290100 FF*4 34920100",
            "Cell ID=-1, Downlink Frequency=76264, Uplink Frequency=16909060, URA ID=37428"},
        // Transmit power is the average of the entries that have one.
        {name, "4031: EE 03 EE @20 18FC @34 0000 @48 0CFE @58", "Transmit Power=-93.50 dBm"},
        {name, "4031: EE 03 EE @20 F7FD @34 F6FD @48 00FE @58", "Transmit Power=-70.33 dBm"}, // toward zero
        {name, "4031: EE 02 EE @20 0000 @34 0000 @44", "Transmit Power= nan dBm"},
        {name, "4031: EE FF EE 6400*1785", "Transmit Power=-9.00 dBm"},
        // The serving cell of the list keeps its UARFCN until the next serving cell packet.
        {name, cell, "Cell ID=65539, UARFCN=76264, Scrambling Code=66047"},
        {name, std::string(cell) + ";4127: 00*16",
            "Cell ID=0, Scrambling Code=66047, Downlink Frequency=0, Uplink Frequency=0, URA ID=0"},
        {name, "FF0001: UMTS Serving", "(nothing)",
            "UMTSRRInfo: Failed to retrieve Cell ID\nUMTSRRInfo: Failed to retrieve UARFCN\n"
            "UMTSRRInfo: Failed to retrieve Scrambling Code\n"},
        {name, "FF0001: no list", "(nothing)", kNoList},
    });
    expectTexts<MRL_GSMClassIndex>(
        {{name, 0x4125, 13, "RRC State", "Disconnected|Connecting|CELL_FACH|CELL_DCH|CELL_PCH|URA_PCH"},
            {name, 0x4157, 13, "Ciphering", "Disabled", "Enabled"}});
}

TEST(WCDMASections, BlockErrors)
{
    expectShown<MRL_GSMClassIndex>({
        {"BLER", "4116: 02 3492 07 01020304 FF*4 08 00000080 FFFFFF7F",
            "Window Size=37428, Transport Channels=["
            "Transport Channel ID=7, CRC Received=67305985, CRC Received in Error=-1 | "
            "Transport Channel ID=8, CRC Received=-2147483648, CRC Received in Error=2147483647]"},
        {"BLER", "4116: 00 3492 07 01020304 FF*4", "Window Size=37428, Transport Channels=[]"},
    });
}

// As an older history entry may hold it.
TEST(WCDMASections, AListInARowIsReplacedWhileSomebodyElseHoldsIt)
{
    const struct {
        const char* section;
        const char* first;
        const char* second;
        const char* row;
    } cases[] = {
        {"BLER", "4116: 01 3492 07 01020304 FF*4", "4116: 00 3492", "Transport Channels"},
        {"HSDPA Info", "4221: 09 21 0B 01 00 FF*9", "4221: 09 21 0B 01 00 EE*9", "Primary HARQ Process"},
        {"Mobile Allocation", "51F8: 3F 01 3412", "51F8: 3F 01 3512", "ARFCNs"},
    };
    const QuietConsole quiet;
    for (const auto& [section, first, second, row] : cases) {
        const MRL_GSMClassIndex index;
        const auto rows = Dictionary::make();
        feed(*index.getClass(section), rows, {packetOfText(first)});
        const ArrayRef held = (*rows)[row].array();
        const std::string before = shown(*held);
        feed(*index.getClass(section), rows, {packetOfText(second)});
        EXPECT_EQ(shown(*held), before) << section;
        EXPECT_NE(shown((*rows)[row]), shown(Value(held))) << section;
    }
}

// Each carrier's processes take 9 bytes. Those of the secondary carrier stand behind room for 18 of each of
// the primary one; a carrier without processes keeps the list it had.
TEST(WCDMASections, HSDPAProcesses)
{
    const char* name = "HSDPA Info";
    const auto record = [](int id) { return text("%02X FEFFFFFF 02 %02X FFFF ", id, id); };
    const auto process = [](int id) {
        return text("Process ID=%d, No Rx Bits=4294967294, New Tx=%d, Block Errors=65535", id, id * 256 + 2);
    };
    const std::string both =
        "4221: 09 21 0B 02 02 " + record(1) + record(2) + "@342 " + record(3) + record(4);
    const auto rows = [](const char* subframes, const char* carriers, const std::string& primary,
                          const std::string& secondary) {
        return text("Version=9, Sub Frames=%s, Carrier Info=%s, Primary HARQ Process=[%s], "
                    "Secondary HARQ Process=[%s]",
            subframes, carriers, primary.c_str(), secondary.c_str());
    };
    const std::string one = process(1) + " | " + process(2);
    const std::string other = process(3) + " | " + process(4);
    expectShown<MRL_GSMClassIndex>({
        {name, both, rows("801", "Dual Carrier", one, other)},
        {name, both + ";4221: 09 21 04 00 01 " + record(5), rows("33", "MIMO", one, process(5))},
        {name, both + ";4221: 09 21 0C 01 00 " + record(5), rows("33", "Reserved", process(5), other)},
        {name, "4221: 09 21 F0 02 01 " + record(1), rows("33", "Single Carrier", process(1), "")},
    });
}

} // namespace
} // namespace orvex::test
