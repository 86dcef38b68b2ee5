// The packets of GSM and UMTS through the receiver's own decoders.

#include "packets/EquivalentPLMNPacket.h"
#include "packets/GPRSCellOptionsPacket.h"
#include "packets/GSMMeasurementPacket.h"
#include "packets/GSMRRStatePacket.h"
#include "packets/GSMServingCellPacket.h"
#include "packets/ServingPLMNPacket.h"
#include "packets/WCDMABlockErrorPacket.h"
#include "packets/WCDMAHARQPacket.h"
#include "packets/WCDMARankingPacket.h"
#include "packets/WCDMASearcherPacket.h"
#include "packets/WCDMAServingCellPacket.h"
#include "packets/WCDMATransmitPowerPacket.h"

#include "ExpectRows.h"

namespace orvex::korat {
namespace {

constexpr Microseconds kTime{1};

TEST(PacketLayout, OfGSM)
{
    const auto measurement =
        GSMMeasurementPacket{-75, 29, 27, true, {{871, -80.4, 24}, {62, -104, -2}}}.message(kTime);
    const auto plmn =
        ServingPLMNPacket{1, ServingPLMNPacket::Service::both, {260, 1, 2}, 0x1234, 7}.message(kTime);
    expectRows("MRL_GSM",
        {{GSMServingCellPacket{871, 63, 4660}.message(kTime), "GSM Serving Cell",
             {{{"Cell ID", "4660"}, {"ARFCN", "871"}, {"BSIC", "63"}}}},
            {measurement, "GSM Serving Cell", {{{"RSSI", "75 dBm"}, {"C1 Value", "29"}, {"C2 Value", "27"}}}},
            {measurement, "Neighboring Cells",
                {{{"ARFCN", "871"}, {"RSSI", "80"}, {"C1 Value", "24"}},
                    {{"ARFCN", "62"}, {"RSSI", "104"}, {"C1 Value", "-2"}}}},
            {measurement, "GPRS Information", {{{"Cell Reselect Hysteresis", "Applied"}}}},
            {GSMRRStatePacket{GSMRRStatePacket::State::dataTransfer, 1, 2, true}.message(kTime),
                "GSM RR Info",
                {{{"RR State", "RR_DATA_TRANSFER"}, {"RR Sub State", "1"}, {"RR Status", "2"},
                    {"RR Mode", "Data"}}}},
            {GPRSCellOptionsPacket{6, 12, true}.message(kTime), "GPRS Information",
                {{{"T3192", "160 ms"}, {"Access Burst Type", "11-bit format"}, {"DRX Timer Max", "12"}}}},
            {plmn, "Serving PLMN",
                {{{"Mobile Country Code", "260"}, {"Mobile Network Code", "01 "},
                    {"Location Area Code", "4660"}, {"Routing Area Code", "7"},
                    {"Service Type", "CS_PS_SERVICE"}}}},
            {plmn, "GPRS Information", {{{"Network Operating Mode", "Class 2"}}}},
            {EquivalentPLMNPacket{{{1, 234, 3}, {345, 167, 3}}}.message(kTime), "Equivalent PLMN List",
                {{{"Mobile Country Code", "1"}, {"Mobile Network Code", "234"}},
                    {{"Mobile Country Code", "345"}, {"Mobile Network Code", "167"}}}}});
}

TEST(PacketLayout, OfUMTS)
{
    using Set = WCDMASearcherPacket::Set;
    const auto process = [](const char* identity, const char* bits, const char* blocks, const char* errors) {
        return test::RowTexts{
            {"Process ID", identity}, {"No Rx Bits", bits}, {"New Tx", blocks}, {"Block Errors", errors}};
    };
    expectRows("MRL_GSM",
        {{WCDMASearcherPacket{-62.5,
              {{511, Set::active, {-2.9, {}, 0}}, {9, Set::monitored, {-9}}, {77, Set::active, {-9.9}}}}
                 .message(kTime),
             "Active Set",
             {{{"Scrambling Code", "511"}, {"RSCP", "-66 dB"}, {"Energy Per Chip", "-3 dB"}},
                 {{"Scrambling Code", "77"}, {"RSCP", "-73 dB"}, {"Energy Per Chip", "-10 dB"}}}},
            {WCDMARankingPacket{{{10838, 511, -101, -99, -7.5, -300}}, {}}.message(kTime), "UMTS Set",
                {{{"Scrambling Code", "511"}, {"RSCP", "-101 dB"}, {"Energy Per Chip", "-7.500000 dB"},
                    {"Downlink Frequency", "10838"}, {"Ranking Value", "-300"},
                    {"Rank Cell RSCP", "-99 dB"}}}},
            {WCDMARankingPacket{{}, {{871, 63, -110, -112}}}.message(kTime), "GSM Set",
                {{{"ARFCN", "871"}, {"BSIC", "63"}, {"RSSI", "-110 dBm"}, {"Ranking Value", "-112"}}}},
            {WCDMAServingCellPacket{9613, 10563, 212 << 16 | 3100, 513}.message(kTime), "UMTS RR Info",
                {{{"Cell ID", "13896732"}, {"Downlink Frequency", "10563"}, {"Uplink Frequency", "9613"},
                    {"URA ID", "513"}}}},
            {WCDMATransmitPowerPacket{{21, {}, -15}}.message(kTime), "UMTS RR Info",
                {{{"Transmit Power", "3.00 dBm"}}}},
            {WCDMABlockErrorPacket{500, {}}.message(kTime), "BLER", {{{"Window Size", "500"}}}}});

    test::Decoding decoding("MRL_GSM");
    decoding.feed(WCDMAHARQPacket{3, 1023, WCDMAHARQPacket::Carriers::dual, {{7, 0x12345678, 258, 1}},
        {{5, 0xFFFFFFFF, 65535, 9}, {4, 8, 7, 6}}}
                      .message(kTime)
                      .bytes);
    const auto rows = (*(*decoding.display())["Packet Data"].dictionary())["HSDPA Info"].dictionary();
    EXPECT_EQ(test::textOf((*rows)["Carrier Info"]), "Dual Carrier");
    EXPECT_EQ(test::textOf((*rows)["Sub Frames"]), "1023");
    const auto primary = (*rows)["Primary HARQ Process"].array();
    const auto secondary = (*rows)["Secondary HARQ Process"].array();
    ASSERT_TRUE(primary->size() == 1 && secondary->size() == 2);
    EXPECT_EQ(test::rowsOf((*primary)[0].dictionary()), process("7", "305419896", "258", "1"));
    EXPECT_EQ(test::rowsOf((*secondary)[1].dictionary()), process("4", "8", "7", "6"));
}

} // namespace
} // namespace orvex::korat
