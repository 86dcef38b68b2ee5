#include "packets/ExtraPacket.h"
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

#include "Decoding.h"

#include <gmock/gmock.h>

namespace orvex::korat {
namespace {

using test::Decoding;
using test::RowTexts;
using testing::ElementsAre;

constexpr Microseconds kTime{1};

std::vector<RowTexts> lteRows(const LogMessage& message, const char* section)
{
    Decoding decoding("MRL_LTE");
    decoding.feed(message.bytes);
    return decoding.rows(section);
}

std::vector<RowTexts> utranRows(const LogMessage& message, const char* section)
{
    Decoding decoding("MRL_UTRAN2");
    decoding.feed(message.bytes);
    return decoding.rows(section);
}

// What goes in as engineering values comes out of the receiver's own decoders as text.

TEST(LTEPackets, ServingCell)
{
    EXPECT_THAT(lteRows(LTEServingCellPacket{301, 1300, 19300, 100, 50, 10322179, 4301, 3}.message(kTime),
                    "Serving Cell Info"),
        ElementsAre(RowTexts{{"Physical Cell ID", "301"}, {"Download Frequency", "1300"},
            {"Upload Frequency", "19300"}, {"Download Bandwidth", "20 MHz"}, {"Upload Bandwidth", "10 MHz"},
            {"Cell Identity", "10322179"}, {"Tracking Area Code", "4301"}, {"Freq Band Indicator", "3"}}));
    EXPECT_THAT(lteRows(LTEAntennaPacket{4}.message(kTime), "Serving Cell Info"),
        ElementsAre(RowTexts{{"Num Tx Antennas", "4"}}));
}

TEST(LTEPackets, IntraFrequency)
{
    const auto message = LTEIntraFrequencyPacket{3100, 503, 9, -98.25, -10.5,
        {{7, -101, -12.125}, {300, -140, -20}},
        {411, 12}}.message(kTime);
    EXPECT_THAT(lteRows(message, "Connected mode LTE Intra-frequency Measurement"),
        ElementsAre(
            RowTexts{{"E-ARFCN", "3100"}, {"Serving Physical Cell ID", "503"}, {"Subframe Number", "9"},
                {"Serving Filtered RSRP", "-98.25 dBm"}, {"Serving Filtered RSRQ", "-10.50 dB"}}));
    EXPECT_THAT(lteRows(message, "Measured Neighbor Cells"),
        ElementsAre(RowTexts{{"Physical Cell ID", "7"}, {"Filtered RSRP", "-101.00 dBm"},
                        {"Filtered RSRQ", "-12.12 dB"}},
            RowTexts{{"Physical Cell ID", "300"}, {"Filtered RSRP", "-140.00 dBm"},
                {"Filtered RSRQ", "-20.00 dB"}}));
    EXPECT_THAT(lteRows(message, "Detected Cells"),
        ElementsAre(RowTexts{{"Physical Cell ID", "411"}}, RowTexts{{"Physical Cell ID", "12"}}));
}

TEST(LTEPackets, ServingMeasurement)
{
    LTEServingMeasurementPacket packet;
    packet.version = 3;
    packet.earfcn = 6300;
    packet.physicalCellID = 487;
    packet.layerPriority = 6;
    packet.rsrp = -91.75;
    packet.averageRSRP = -93.5;
    packet.rsrq = -8.25;
    packet.averageRSRQ = -9;
    packet.rssi = -64.5;
    packet.qRxLevMin = -126;
    packet.pMax = 23;
    packet.maximumPower = 24;
    packet.sRxLev = 33;
    packet.drxCyclesBelowZero = 5;
    packet.sIntraSearch = 62;
    packet.rulesUpdated = true;
    packet.rules = 9;
    const RowTexts expected{{"Version", "3"}, {"E-ARFCN", "6300"}, {"Physical Cell ID", "487"},
        {"Serving Layer Priority", "6"}, {"Measured RSRP", "-91.75 dBm"}, {"Average RSRP", "-93.50 dBm"},
        {"Measured RSRQ", "-8.25 dB"}, {"Average RSRQ", "-9.00 dB"}, {"Measured RSSI", "-64.50 dBm"},
        {"Qrxlevmin", "-126 dBm"}, {"P_Max", "23 dBm"}, {"Max UE Tx Power", "24 dBm"}, {"Srxlev", "33 dBm"},
        {"Num of Consecutive DRX Cycles of S < 0", "5"}, {"S Intra Search", "62 dB"},
        {"S Non Intra Search", "Not Present"}, {"Measurement Rules Updated", "True"},
        {"Measurement Rules", "9"}};
    EXPECT_THAT(lteRows(packet.message(kTime), "Serving Cell Measurements"), ElementsAre(expected));
}

TEST(LTEPackets, NeighborMeasurement)
{
    const auto message = LTENeighborMeasurementPacket{2, 1300, -128,
        {{9, -70, -100, -101, -12, -13, 28, 0, 0, 0},
            {77, -71.5, -99.5, -98, -11.25, -10.5, 30, 12, 1023,
                307199}}}.message(kTime);
    EXPECT_THAT(lteRows(message, "Neighbor Measurements"),
        ElementsAre(RowTexts{{"Version", "2"}, {"E-ARFCN", "1300"}, {"Qrxlevmin", "-128 dBm"}}));
    const auto cells = lteRows(message, "Neighbor Cells List");
    ASSERT_EQ(cells.size(), 2U);
    EXPECT_EQ(cells[1],
        (RowTexts{{"Physical Cell ID", "77"}, {"Measured RSSI", "-71.50 dBm"},
            {"Measured RSRP", "-99.50 dBm"}, {"Average RSRP", "-98.00 dBm"}, {"Measured RSRQ", "-11.25 dB"},
            {"Average RSRQ", "-10.50 dB"}, {"Srxlev", "30 dBm"}, {"Frequency Offset", "12"},
            {"Ant 0 Frame Offset", "1023"}, {"Ant 0 Sample Offset", "307199"}, {"Ant 1 Frame Offset", "1023"},
            {"Ant 1 Sample Offset", "307199"}}));
}

TEST(LTEPackets, ReselectionCandidateByTechnology)
{
    using Candidate = LTEReselectionPacket::Candidate;
    const auto candidateRows = [](const Candidate& last) {
        // Another candidate before it: its details must not disturb the last one.
        return lteRows(
            LTEReselectionPacket{1, 1300, 77, {Candidate::makeGERAN(1, 50, 1, 9), last}}.message(kTime),
            "Reselection Candidates List")
            .at(1);
    };
    const struct {
        const char* name;
        Candidate candidate;
        RowTexts rows;
    } cases[] = {
        {"LTE", Candidate::makeLTE(7, 3100, 503),
            {{"Candidate Priority", "7"}, {"Candidate RAT Type", "LTE"}, {"E ARFCN", "3100"},
                {"Cell ID", "503"}}},
        {"UTRAN", Candidate::makeUTRAN(3, 10588, 511),
            {{"Candidate Priority", "3"}, {"Candidate RAT Type", "UTRAN"}, {"U ARFCN", "10588"},
                {"PSC", "511"}}},
        {"GERAN", Candidate::makeGERAN(2, 871, 1, 63),
            {{"Candidate Priority", "2"}, {"Candidate RAT Type", "GERAN"}, {"ARFCN", "871"}, {"Band", "1"},
                {"BSIC ID", "63"}}},
        {"HRPD", Candidate::makeCDMA(Candidate::Technology::cdmaHRPD, 1, 6, 1175, 511),
            {{"Candidate Priority", "1"}, {"Candidate RAT Type", "CDMAHRPD"}, {"Band", "6"},
                {"Channel", "1175"}, {"Pilot", "511"}}},
    };
    for (const auto& [name, candidate, rows] : cases)
        EXPECT_EQ(candidateRows(candidate), rows) << name;
    EXPECT_THAT(lteRows(LTEReselectionPacket{2, 1300, 77, {}}.message(kTime), "Reselection Candidates"),
        ElementsAre(RowTexts{{"Version", "2"}, {"Serving EARFCN", "1300"}, {"Serving Cell ID", "77"}}));
}

TEST(UTRANPackets, StateAndServingCell)
{
    using State = UTRANRRCStatePacket::State;
    EXPECT_THAT(utranRows(UTRANRRCStatePacket{State::cellDCH}.message(kTime), "RRC Info"),
        ElementsAre(RowTexts{{"State", "Cell DCH"}}));
    EXPECT_THAT(utranRows(UTRANRRCStatePacket{}.message(kTime), "RRC Info"),
        ElementsAre(RowTexts{{"State", "Unknown RRC Mode"}}));
    EXPECT_THAT(utranRows(UTRANServingCellPacket{2, 12, 10055, 10063, 212 << 16 | 3100, true}.message(kTime),
                    "Serving Cell Info"),
        ElementsAre(
            RowTexts{{"Cell Access Restrictions", "2"}, {"Cell ID", "13896732"}, {"Downlink UARFCN", "10063"},
                {"Uplink UARFCN", "10055"}, {"URA ID", "12"}, {"Allowed Access", "Emergency Calls Only"}}));
}

TEST(UTRANPackets, Neighbors)
{
    using Set = UTRANNeighborPacket::Set;
    const auto message =
        UTRANNeighborPacket{{{10055, 127, 0.5, Set::monitored, false}, {10071, 3, 1, Set::none, true}}}
            .message(kTime);
    EXPECT_THAT(utranRows(message, "Neighbor Cell List"),
        ElementsAre(RowTexts{{"UARFCN", "10055"}, {"Cell ID", "127"}, {"Filter RSCP", "0.500000"},
                        {"Status", "MSET"}, {"inJDCS", "FALSE"}},
            RowTexts{
                {"UARFCN", "10071"}, {"Cell ID", "3"}, {"Filter RSCP", "0.996094"}, {"inJDCS", "TRUE"}}));
}

TEST(UTRANPackets, GSMNeighborBytes) // no screen shows them
{
    const auto bytes =
        UTRANGSMNeighborPacket{{{}, {2001, false, true, 7, 5, 871, -83.4}}}.message(kTime).bytes;
    EXPECT_EQ(Bytes(bytes.begin() + 16, bytes.end()),
        (Bytes{2, 0, 0, 0, 0, 0, 0, 0, 0, 0xD1, 0x87, 7, 5, 0x67, 0x03, 0xAD, 0xFF}));
}

TEST(UTRANPackets, TransportChannels)
{
    const auto message = UTRANTransportChannelPacket{{{1, 63}, {2, 0}, {63, 7}},
        {{1, 6, {1, 2, 3, 4, 5, 63}}, {15, 0, {9, 8, 7, 6, 5, 4}}}}
                             .message(kTime);
    EXPECT_THAT(utranRows(message, "TRCH BLER"),
        ElementsAre(RowTexts{{"TRCH ID", "1"}, {"TRCH BLER Measurement", "63"}},
            RowTexts{{"TRCH ID", "2"}, {"TRCH BLER Measurement", "0"}},
            RowTexts{{"TRCH ID", "63"}, {"TRCH BLER Measurement", "7"}}));
    EXPECT_THAT(utranRows(message, "CCTRCH SIR"),
        ElementsAre(RowTexts{{"CCTRCH ID", "1"}, {"TSNUM", "6"}, {"SIR", "[1, 2, 3, 4, 5, 63]"}},
            RowTexts{{"CCTRCH ID", "15"}, {"TSNUM", "0"}, {"SIR", "[9, 8, 7, 6, 5, 4]"}}));
}

} // namespace
} // namespace orvex::korat
