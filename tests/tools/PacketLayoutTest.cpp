#include "packets/LTEAntennaPacket.h"
#include "packets/LTEIntraFrequencyPacket.h"
#include "packets/LTENeighborMeasurementPacket.h"
#include "packets/LTEReselectionPacket.h"
#include "packets/LTEServingCellPacket.h"
#include "packets/LTEServingMeasurementPacket.h"
#include "packets/UTRANGSMNeighborPacket.h"
#include "packets/UTRANNeighborPacket.h"
#include "packets/UTRANRRCStatePacket.h"
#include "packets/UTRANServingCellPacket.h"
#include "packets/UTRANTransportChannelPacket.h"

#include "ExpectRows.h"

namespace orvex::korat {
namespace {

constexpr Microseconds kTime{1};

TEST(PacketLayout, OfLTE)
{
    const auto intraFrequency = LTEIntraFrequencyPacket{3100, 503, 9, -98.25, -10.5,
        {{7, -101, -12.125}, {300, -140, -20}},
        {411, 12}}.message(kTime);
    LTEServingMeasurementPacket serving;
    serving.version = 3;
    serving.earfcn = 6300;
    serving.physicalCellID = 487;
    serving.layerPriority = 6;
    serving.rsrp = -91.75;
    serving.averageRSRP = -93.5;
    serving.rsrq = -8.25;
    serving.averageRSRQ = -9;
    serving.rssi = -64.5;
    serving.qRxLevMin = -126;
    serving.pMax = 23;
    serving.maximumPower = 24;
    serving.sRxLev = 33;
    serving.drxCyclesBelowZero = 5;
    serving.sIntraSearch = 62;
    serving.rulesUpdated = true;
    serving.rules = 9;
    const auto neighbors = LTENeighborMeasurementPacket{2, 1300, -128,
        {{9, -70, -100, -101, -12, -13, 28, 0, 0, 0},
            {77, -71.5, -99.5, -98, -11.25, -10.5, 30, 12, 1023,
                307199}}}.message(kTime);
    expectRows("MRL_LTE",
        {{LTEServingCellPacket{301, 1300, 19300, 100, 50, 10322179, 4301, 3}.message(kTime),
             "Serving Cell Info",
             {{{"Physical Cell ID", "301"}, {"Download Frequency", "1300"}, {"Upload Frequency", "19300"},
                 {"Download Bandwidth", "20 MHz"}, {"Upload Bandwidth", "10 MHz"},
                 {"Cell Identity", "10322179"}, {"Tracking Area Code", "4301"},
                 {"Freq Band Indicator", "3"}}}},
            {LTEAntennaPacket{4}.message(kTime), "Serving Cell Info", {{{"Num Tx Antennas", "4"}}}},
            {intraFrequency, "Connected mode LTE Intra-frequency Measurement",
                {{{"E-ARFCN", "3100"}, {"Serving Physical Cell ID", "503"}, {"Subframe Number", "9"},
                    {"Serving Filtered RSRP", "-98.25 dBm"}, {"Serving Filtered RSRQ", "-10.50 dB"}}}},
            {intraFrequency, "Measured Neighbor Cells",
                {{{"Physical Cell ID", "7"}, {"Filtered RSRP", "-101.00 dBm"},
                     {"Filtered RSRQ", "-12.12 dB"}},
                    {{"Physical Cell ID", "300"}, {"Filtered RSRP", "-140.00 dBm"},
                        {"Filtered RSRQ", "-20.00 dB"}}}},
            {intraFrequency, "Detected Cells", {{{"Physical Cell ID", "411"}}, {{"Physical Cell ID", "12"}}}},
            {serving.message(kTime), "Serving Cell Measurements",
                {{{"Version", "3"}, {"E-ARFCN", "6300"}, {"Physical Cell ID", "487"},
                    {"Serving Layer Priority", "6"}, {"Measured RSRP", "-91.75 dBm"},
                    {"Average RSRP", "-93.50 dBm"}, {"Measured RSRQ", "-8.25 dB"},
                    {"Average RSRQ", "-9.00 dB"}, {"Measured RSSI", "-64.50 dBm"}, {"Qrxlevmin", "-126 dBm"},
                    {"P_Max", "23 dBm"}, {"Max UE Tx Power", "24 dBm"}, {"Srxlev", "33 dBm"},
                    {"Num of Consecutive DRX Cycles of S < 0", "5"}, {"S Intra Search", "62 dB"},
                    {"S Non Intra Search", "Not Present"}, {"Measurement Rules Updated", "True"},
                    {"Measurement Rules", "9"}}}},
            {neighbors, "Neighbor Measurements",
                {{{"Version", "2"}, {"E-ARFCN", "1300"}, {"Qrxlevmin", "-128 dBm"}}}},
            {LTEReselectionPacket{2, 1300, 77, {}}.message(kTime), "Reselection Candidates",
                {{{"Version", "2"}, {"Serving EARFCN", "1300"}, {"Serving Cell ID", "77"}}}}});

    using Candidate = LTEReselectionPacket::Candidate;
    const std::pair<Candidate, test::RowTexts> candidates[] = {
        {Candidate::makeLTE(7, 3100, 503),
            {{"Candidate Priority", "7"}, {"Candidate RAT Type", "LTE"}, {"E ARFCN", "3100"},
                {"Cell ID", "503"}}},
        {Candidate::makeUTRAN(3, 10588, 511),
            {{"Candidate Priority", "3"}, {"Candidate RAT Type", "UTRAN"}, {"U ARFCN", "10588"},
                {"PSC", "511"}}},
        {Candidate::makeGERAN(2, 871, 1, 63),
            {{"Candidate Priority", "2"}, {"Candidate RAT Type", "GERAN"}, {"ARFCN", "871"}, {"Band", "1"},
                {"BSIC ID", "63"}}},
        {Candidate::makeCDMA(Candidate::Technology::cdmaHRPD, 1, 6, 1175, 511),
            {{"Candidate Priority", "1"}, {"Candidate RAT Type", "CDMAHRPD"}, {"Band", "6"},
                {"Channel", "1175"}, {"Pilot", "511"}}},
    };
    test::Decoding decoding("MRL_LTE");
    for (const auto& [candidate, rows] : candidates) {
        // Details of the one before must not disturb those of the last.
        decoding.feed(LTEReselectionPacket{2, 1300, 77, {Candidate::makeGERAN(1, 50, 1, 9), candidate}}
                          .message(kTime)
                          .bytes);
        EXPECT_EQ(decoding.rows("Reselection Candidates List").at(1), rows);
    }
    decoding.feed(neighbors.bytes);
    EXPECT_EQ(decoding.rows("Neighbor Cells List").at(1),
        (test::RowTexts{{"Physical Cell ID", "77"}, {"Measured RSSI", "-71.50 dBm"},
            {"Measured RSRP", "-99.50 dBm"}, {"Average RSRP", "-98.00 dBm"}, {"Measured RSRQ", "-11.25 dB"},
            {"Average RSRQ", "-10.50 dB"}, {"Srxlev", "30 dBm"}, {"Frequency Offset", "12"},
            {"Ant 0 Frame Offset", "1023"}, {"Ant 0 Sample Offset", "307199"}, {"Ant 1 Frame Offset", "1023"},
            {"Ant 1 Sample Offset", "307199"}}));
}

TEST(PacketLayout, OfUTRAN)
{
    using State = UTRANRRCStatePacket::State;
    using Set = UTRANNeighborPacket::Set;
    const auto channels = UTRANTransportChannelPacket{{{1, 63}, {63, 7}},
        {{1, 6, {1, 2, 3, 4, 5, 63}}, {15, 0, {9, 8, 7, 6, 5, 4}}}}
                              .message(kTime);
    expectRows("MRL_UTRAN2",
        {{UTRANRRCStatePacket{State::cellDCH}.message(kTime), "RRC Info", {{{"State", "Cell DCH"}}}},
            {UTRANRRCStatePacket{}.message(kTime), "RRC Info", {{{"State", "Unknown RRC Mode"}}}},
            {UTRANServingCellPacket{2, 12, 10055, 10063, 212 << 16 | 3100, true}.message(kTime),
                "Serving Cell Info",
                {{{"Cell Access Restrictions", "2"}, {"Cell ID", "13896732"}, {"Downlink UARFCN", "10063"},
                    {"Uplink UARFCN", "10055"}, {"URA ID", "12"},
                    {"Allowed Access", "Emergency Calls Only"}}}},
            {UTRANNeighborPacket{{{10055, 127, 0.5, Set::monitored, false}, {10071, 3, 1, Set::none, true}}}
                    .message(kTime),
                "Neighbor Cell List",
                {{{"UARFCN", "10055"}, {"Cell ID", "127"}, {"Filter RSCP", "0.500000"}, {"Status", "MSET"},
                     {"inJDCS", "FALSE"}},
                    {{"UARFCN", "10071"}, {"Cell ID", "3"}, {"Filter RSCP", "0.996094"},
                        {"inJDCS", "TRUE"}}}},
            {channels, "TRCH BLER",
                {{{"TRCH ID", "1"}, {"TRCH BLER Measurement", "63"}},
                    {{"TRCH ID", "63"}, {"TRCH BLER Measurement", "7"}}}},
            {channels, "CCTRCH SIR",
                {{{"CCTRCH ID", "1"}, {"TSNUM", "6"}, {"SIR", "[1, 2, 3, 4, 5, 63]"}},
                    {{"CCTRCH ID", "15"}, {"TSNUM", "0"}, {"SIR", "[9, 8, 7, 6, 5, 4]"}}}}});

    // No screen shows these.
    const auto gsm = UTRANGSMNeighborPacket{{{}, {2001, false, true, 7, 5, 871, -83.4}}}.message(kTime).bytes;
    EXPECT_EQ(Bytes(gsm.begin() + 16, gsm.end()),
        (Bytes{2, 0, 0, 0, 0, 0, 0, 0, 0, 0xD1, 0x87, 7, 5, 0x67, 0x03, 0xAD, 0xFF}));
}

} // namespace
} // namespace orvex::korat
