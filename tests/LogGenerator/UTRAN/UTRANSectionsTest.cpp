#include "UTRAN/NeighbhorMeasurements.h"
#include "UTRAN/TransportChannels.h"
#include "UTRAN/UTRANLogGenerator.h"

#include "SectionCases.h"

namespace orvex::test {
namespace {

TEST(UTRANSections, RRCInfo)
{
    const char* name = "RRC Info";
    expectShown<UTRANClassIndex>({
        {name, "D0E0: 01 00", "State=Disconnected"},
        {name, "D0E0: 01 01", "State=Connecting"},
        {name, "D0E0: 01 02", "State=Cell Fach"},
        {name, "D0E0: 01 03", "State=Cell DCH"},
        {name, "D0E0: 01 04", "State=Cell PCH"},
        {name, "D0E0: 01 05", "State=Cell URA PCH"},
        {name, "D0E0: 01 06", "State=Unknown RRC Mode"},
        {name, "D0E0: 00 03", "State=Unknown RRC Mode"},
    });

    const UTRANClassIndex index;
    std::vector<std::string> console;
    installConsole([&console](std::string_view line) { console.emplace_back(line); });
    const auto rows = Dictionary::make();
    index.getClass(name)->updateSectionRef(rows);
    const RecordingLog log;
    index.getClass(name)->updateWithData(packetOfText("D0E0: 01 03"), 0xD0E0);
    index.getClass(name)->updateWithData(packetOfText("D0E0: 01"), 0xD0E0);
    installConsole({});
    EXPECT_EQ(console,
        (std::vector<std::string>{"Display Dict = {State = Cell DCH; }, rrc mode = 3 Cell DCH",
            "Display Dict = {State = Unknown RRC Mode; }, rrc mode = 255 Unknown RRC Mode"}));
    EXPECT_EQ(log.lines,
        (std::vector<std::string>{
            "<4>RRC Info", "<4>RRC Info", "<4>LogCode_0xD0E0 is length is 14 expected size 15"}));
}

TEST(UTRANSections, ServingCellInfo)
{
    const char* name = "Serving Cell Info";
    const std::string failed = name + std::string(": Failed to retrieve ");
    const std::string all = failed + "LAC\n" + failed + "Cell ID\n" + failed + "Freq Band Indicator\n"
        + failed + "Cell Scrambling Code\n" + failed + "UARFCN\n";
    expectShown<UTRANClassIndex>({
        {name, "D0E2: AA 87 89 AA 0182 0384 785634F2 03",
            "Cell Access Restrictions=135, Cell ID=-231451016, Downlink UARFCN=33795, Uplink UARFCN=33281, "
            "URA ID=137, Allowed Access=Emergency Calls Only"},
        {name, "D0E2: 00*12 02",
            "Cell Access Restrictions=0, Cell ID=0, Downlink UARFCN=0, Uplink UARFCN=0, URA ID=0, "
            "Allowed Access=All Calls"},
        // Every serving cell is applied.
        {name,
            "FF0001: UTRAN Serving UARFCN=10054 LAC=1 CellID=2 BandInfo=3 ScramblingCode=4,"
            "UTRAN Serving UARFCN=10054 CellID=5 BandInfo=6 ScramblingCode=7,UTRAN Neighbor LAC=8,UMTS "
            "Serving",
            "Local Area Code=1, Cell ID=5, Freq Band Indicator=6, Cell Scrambling Code=7, "
            "Uplink UARFCN=10054, Downlink UARFCN=10054",
            "Serving Cell Info: Failed to retrieve LAC\n"},
        {name, "FF0001: UTRAN Serving", "(nothing)", all.c_str()},
        {name, "FF0001: no list", "(nothing)", "Cell Info Array data could not be constructed"},
        {name, "FF0001: <string>x</string>", "throws orvex::CellMonitorList::WrongKindException"},
    });
}

TEST(UTRANSections, NeighborCellLists)
{
    const char* name = "Neighbor Cell List";
    expectShown<UTRANClassIndex>({
        // The fourth set has no name and no row.
        {name, "D00A: @16 05 @168 14:10054 7:99 8:128 2:1 1:0 00*12 FF*16",
            "UARFCN=10054, Cell ID=99, Filter RSCP=0.500000, Status=MSET, inJDCS=FALSE | "
            "UARFCN=16383, Cell ID=127, Filter RSCP=0.996094, inJDCS=TRUE"},
        {name, "D00A: @16 04 @168 32:0 00*12 29:0 2:2 1:0 00*12",
            "UARFCN=0, Cell ID=0, Filter RSCP=0.000000, Status=ASET, inJDCS=FALSE | "
            "UARFCN=0, Cell ID=0, Filter RSCP=0.000000, Status=DSET, inJDCS=FALSE"},
        {name, "D00A: @16 01 @168 00*16", "#0"}, // bit 0 is not the count's
        {name, "D00A: @16 FE @168 00*2048", "#127"},
        {"GSM Neighbor Cell List", "D00E: @16 03 01*24", "(empty)"}, // never filled
    });

    const Bytes bytes = packetOfText("D00E: @16 01 3492 05 06 0702 A6FF");
    const auto neighbor = LogCode_0xD00E(bytes).neighbors()[0];
    EXPECT_EQ(neighbor.cellIdentity(), 0x1234);
    EXPECT_EQ(neighbor.bandIndicator(), 0);
    EXPECT_EQ(neighbor.bsicValid(), 1);
    EXPECT_EQ(neighbor.ncc(), 5);
    EXPECT_EQ(neighbor.bcc(), 6);
    EXPECT_EQ(neighbor.arfcn(), 519);
    EXPECT_EQ(neighbor.rssi(), -90);
    EXPECT_THROW(LogCode_0xD00E(bytes).neighbors()[1], ArrayOutOfBoundsException);
}

// 0xD00C: 63 transport channels and 15 composite ones. The composite channels stand behind room for all.
TEST(UTRANSections, TransportChannelMeasurements)
{
    const char* transport = "TRCH BLER";
    const char* composite = "CCTRCH SIR";
    const char* one = "D00C: 00 6:63 6:1 4:1 00 01 C8 @323 0A 0B 0C 0D 0E 0F 10 11";
    expectShown<UTRANClassIndex>({
        {transport, one, "TRCH ID=1, TRCH BLER Measurement=200"},
        {composite, one, "CCTRCH ID=10, TSNUM=11, SIR=[12 | 13 | 14 | 15 | 16 | 17]"},
        {transport, "D00C: 00 6:0 6:63 4:15 @2551", "#63"},
        {composite, "D00C: 00 6:0 6:63 4:15 @2551", "#15"},
    });
    const Bytes bytes = packetOfText("D00C: 00 6:0 6:2 4:1 @400");
    EXPECT_THROW(LogCode_0xD00C(bytes).compositeChannels()[0].sir(6), ArrayOutOfBoundsException);
}

} // namespace
} // namespace orvex::test
