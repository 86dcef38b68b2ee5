#include "LTE/LTELogGenerator.h"
#include "LTE/ReselectionCandidates.h"

#include "SectionCases.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

TEST(LTESections, ServingCellInfo)
{
    const char* name = "Serving Cell Info";
    expectShown<LTEClassIndex>({
        // The first serving LTE cell of the list. The next serving cell packet drops its UARFCN.
        {name,
            "FF0001: LTE Neighbor TAC=1, GSM Serving TAC=2,, LTE Serving TAC=2147483647 CellID=-7 "
            "PhysicalCellID=503 BandInfo=20 UARFCN=6300, LTE Serving TAC=3",
            "Tracking Area Code=2147483647, Cell Identity=-7, Physical Cell ID=503, "
            "Freq Band Indicator=20, UARFCN=6300"},
        {name,
            "FF0001: LTE Serving TAC=1 CellID=1 PhysicalCellID=1 BandInfo=1 UARFCN=6300;"
            "B0C2: AA 0101 0203 524C 06 64 785634F2 CDAB 07000100 BB*6",
            "Tracking Area Code=43981, Cell Identity=-231451016, Physical Cell ID=257, "
            "Freq Band Indicator=65543, Download Frequency=770, Upload Frequency=19538, "
            "Download Bandwidth=1.4 MHz, Upload Bandwidth=20 MHz"},
        // Numbers beyond 32 bits and other kinds are none.
        {name,
            "FF0001: <array><string>x</string><dict><key>RadioAccessTechnology</key><string>LTE</string>"
            "<key>CellType</key><string>Serving</string><key>CellID</key><integer>2147483648</integer>"
            "<key>PhysicalCellID</key><real>5</real><key>BandInfo</key><true/>"
            "<key>UARFCN</key><string>7</string></dict></array>",
            "(nothing)",
            "Serving Cell Info: Failed to retrieve TAC\nServing Cell Info: Failed to retrieve Cell ID\n"
            "Serving Cell Info: Failed to retrieve Physical Cell ID\n"
            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"
            "Serving Cell Info: Failed to retrieve UARFCN\n"},
        {name, "FF0001: no list", "(nothing)",
            "Cell Info Array data could not be constructedFailed to get Cell Array\n"},
        {name, "FF0001: <dict/>", "throws orvex::CellMonitorList::WrongKindException"},
        // Every antenna packet is reported, although it is decoded.
        {name, "B0C1: 00 01 02 03 09 05 06 04 08", "Num Tx Antennas=4",
            "Received an unknown log message: 45249"},
    });
    const char* bandwidths = "6=1.4 MHz|15=3 MHz|25=5 MHz|50=10 MHz|75=15 MHz|100=20 MHz";
    expectTexts<LTEClassIndex>({{name, 0xB0C2, 20, "Download Bandwidth", bandwidths},
        {name, 0xB0C2, 21, "Upload Bandwidth", bandwidths}});
}

TEST(LTESections, ConnectedModeMeasurement)
{
    const char* neighbors = "Measured Neighbor Cells";
    const std::string cells = "0101 1801 5000 F701 0000 A000 2A00";
    expectShown<LTEClassIndex>({
        {"Connected mode LTE Intra-frequency Measurement", "B179: 09*4 0182 0384 0586 1881 5180 00 00",
            "E-ARFCN=33281, Serving Physical Cell ID=33795, Subframe Number=34309, "
            "Serving Filtered RSRP=8122.00 dBm, Serving Filtered RSRQ=4086.12 dB"},
        {neighbors, "B179: @27 02 01 " + cells,
            "Physical Cell ID=257, Filtered RSRP=-70.00 dBm, Filtered RSRQ=-10.00 dB | "
            "Physical Cell ID=503, Filtered RSRP=-140.00 dBm, Filtered RSRQ=0.00 dB"},
        {neighbors, "B179: @27 FF 00 00*1530", "#255"},
        {"Detected Cells", "B179: @27 02 01 " + cells, "Physical Cell ID=42"},
        {"Detected Cells", "B179: @27 00 FF 00*510", "#255"},
    });
}

TEST(LTESections, ServingCellMeasurements)
{
    const char* name = "Serving Cell Measurements";
    expectShown<LTEClassIndex>({
        {name,
            "B17F: 85 00*3 9C98 9:501 4:13 3:7 9:280 9:279 7:81 7:77 9:407 6:37 7:117 6:53 4:15 7:101 6:33 "
            "6:49 6:37 1:1 4:10 2:3",
            "Version=133, E-ARFCN=39068, Physical Cell ID=501, Serving Layer Priority=13, "
            "Measured RSRP=-70.00 dBm, Average RSRP=-70.25 dBm, Measured RSRQ=-9.75 dB, "
            "Average RSRQ=-10.75 dB, Measured RSSI=63.50 dBm, Qrxlevmin=-66 dBm, P_Max=87 dBm, "
            "Max UE Tx Power=23 dBm, Srxlev=71 dBm, Num of Consecutive DRX Cycles of S < 0=33, "
            "S Intra Search=98 dB, S Non Intra Search=74 dBm, Measurement Rules Updated=True, "
            "Measurement Rules=10"},
        {name, "B17F: 00*6 63:0 7:64 23:0 6:32 6:32 7:0",
            "Version=0, E-ARFCN=0, Physical Cell ID=0, Serving Layer Priority=0, "
            "Measured RSRP=-140.00 dBm, Average RSRP=-140.00 dBm, Measured RSRQ=-30.00 dB, "
            "Average RSRQ=-30.00 dB, Measured RSSI=-140.00 dBm, Qrxlevmin=-140 dBm, P_Max=Not Present, "
            "Max UE Tx Power=-30 dBm, Srxlev=-30 dBm, Num of Consecutive DRX Cycles of S < 0=0, "
            "S Intra Search=Not Present, S Non Intra Search=Not Present, Measurement Rules Updated=False, "
            "Measurement Rules=0"},
    });
}

TEST(LTESections, NeighborMeasurements)
{
    const char* name = "Neighbor Cells List";
    const std::string first = "9:257 8:100 9:81 6:63 9:79 7:80 7:77 7:20 2:3 16:32769 16:65535 11:1030 "
                              "19:300000 34:17179869183 ";
    expectShown<LTEClassIndex>({
        {"Neighbor Measurements", "B180: 83 00*3 9C98 6:37 5:0 5:31",
            "Version=131, E-ARFCN=39068, Qrxlevmin=-66 dBm"},
        {name, "B180: @19 6:0 5:1 5:0 " + first + "FF*20",
            "Physical Cell ID=257, Measured RSSI=-90.00 dBm, Measured RSRP=-99.50 dBm, "
            "Average RSRP=-100.50 dBm, Measured RSRQ=-10.00 dB, Average RSRQ=-10.75 dB, Srxlev=-10 dBm, "
            "Frequency Offset=32769, Ant 0 Frame Offset=1030, Ant 0 Sample Offset=300000, "
            "Ant 1 Frame Offset=1030, Ant 1 Sample Offset=300000 | "
            "Physical Cell ID=511, Measured RSSI=-12.50 dBm, Measured RSRP=115.50 dBm, "
            "Average RSRP=115.50 dBm, Measured RSRQ=1.75 dB, Average RSRQ=1.75 dB, Srxlev=97 dBm, "
            "Frequency Offset=65535, Ant 0 Frame Offset=2047, Ant 0 Sample Offset=524287, "
            "Ant 1 Frame Offset=2047, Ant 1 Sample Offset=524287"},
        {name, "B180: @19 6:63 5:0 5:31 07*40", "#1"}, // count bits 0 stand for one
        {name, "B180: @19 6:0 5:31 5:0 07*640", "#32"},
    });

    const LTEClassIndex index;
    index.getClass(name)->updateSectionRef(Array::make());
    const RecordingLog log;
    index.getClass(name)->updateWithData(packetOfText("B180: @19 6:0 5:31 5:0 " + first), 0xB180);
    EXPECT_THAT(log.lines,
        testing::ElementsAre("<4>Neighbor Cells List", "<4>Number of neighboring cells being reported: 32\n",
            "<4>Physical Cell ID: 257\n", "<4>Measured RSSI: -90.000000\n", "<4>Measured RSSI: -99.500000\n",
            "<4>Measured RSSI: -100.500000\n", "<4>Measured RSSI: -10.000000\n",
            "<4>Measured RSSI: -10.750000\n"));
}

TEST(LTESections, ReselectionCandidates)
{
    const char* name = "Reselection Candidates List";
    const std::string rest = " 0102 8043 05060708";
    const std::string priority = "Candidate Priority=261, Candidate RAT Type=";
    expectShown<LTEClassIndex>({
        {"Reselection Candidates", "B186: 02 00 9C18 0102 0000",
            "Version=2, Serving EARFCN=6300, Serving Cell ID=513"},
        {name, "B186: @19 0100 0501 0000" + rest, priority + "LTE, E ARFCN=513, Cell ID=135"},
        {name, "B186: @19 0100 0501 0100" + rest, priority + "UTRAN, U ARFCN=513, PSC=17280"},
        {name, "B186: @19 0100 0501 0200" + rest, priority + "GERAN, ARFCN=513, Band=128, BSIC ID=67"},
        {name, "B186: @19 0100 0501 0300" + rest, priority + "CDMA1XRTT, Band=1, Channel=1541, Pilot=2055"},
        {name, "B186: @19 0100 0501 0400" + rest, priority + "CDMAHRPD, Band=1, Channel=1541, Pilot=2055"},
        {name, "B186: @19 0100 0501 0001", priority + "??"},
        {name, "B186: @19 0100 0501 0400 0102 8043 050607", "(empty)"},
        // Two candidates 4 bytes apart: the fields of the first are the header of the second. More than fit:
        // the last fields are taken for a header too.
        {name, "B186: @19 FFFF 0100 0000 0200 0000 9C18 8000",
            "Candidate Priority=1, Candidate RAT Type=LTE, E ARFCN=2, Cell ID=0 | "
            "Candidate Priority=2, Candidate RAT Type=LTE, E ARFCN=6300, Cell ID=1 | "
            "Candidate Priority=6300, Candidate RAT Type=??"},
        {name, "B186: @19 0001 00*2000", "#256"},
    });

    const Bytes bytes = packetOfText("B186: @19 0100 0000 0200 00000000");
    const auto candidate = LogCode_0xB186(bytes).candidates()[0];
    EXPECT_THROW(candidate.lteFields(), ArrayOutOfBoundsException);
    EXPECT_THROW(candidate.utranFields(), ArrayOutOfBoundsException);
    EXPECT_THROW(candidate.cdmaFields(), ArrayOutOfBoundsException);
}

} // namespace
} // namespace orvex::test
