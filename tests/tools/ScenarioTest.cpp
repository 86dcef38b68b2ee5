// What koratd's scenarios send, and what a receiver shows of it.

#include "Decoding.h"
#include "ScenarioItems.h"

#include "PacketReader.h"
#include "TextFormat.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <map>
#include <set>
#include <sstream>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

// What one row has shown, in all records of its list; or how many records a list had.
struct Seen {
    std::set<std::string> texts;
    double least = std::numeric_limits<double>::infinity();
    double most = -std::numeric_limits<double>::infinity();

    void note(double number)
    {
        least = std::min(least, number);
        most = std::max(most, number);
    }
    void note(const std::string& text)
    {
        if (text.empty() || text == "—" || !texts.insert(text).second)
            return;
        const auto digit = text.find_first_of("0123456789");
        if (digit != std::string::npos)
            note(std::stod(text.substr(digit > 0 && text[digit - 1] == '-' ? digit - 1 : digit)));
    }
    bool isSilent() const { return texts.empty() && most <= 0; }
};

using SeenByPath = std::map<std::string, Seen>;

void noteShown(SeenByPath& seen, const std::string& path, const Value& value)
{
    if (const auto rows = value.dictionary()) {
        for (const auto& [row, shown] : *rows) // those of pilots are numbered
            noteShown(seen, path + "/" + (row.find(';') == std::string::npos ? row : "Pilot"), shown);
    } else if (const auto list = value.array()) {
        seen[path + "/#"].note(static_cast<double>(list->size()));
        for (const Value& record : *list)
            noteShown(seen, path + (record.array() ? "/" : ""), record);
    } else {
        ASSERT_TRUE(value.string()) << path;
        seen[path].note(*value.string());
    }
}

// What a receiver shows in ten minutes: between which numbers a row moved, or how many texts it had; "#" is
// the number of a list's records. Bounds may be off by a fiftieth of their distance. "~" stands before what
// one text holds.
const struct {
    const char* technology;
    const char* section;
    const char* rows;
} kShown[] = {
    {"MRL_GSM", "Mobility/Equivalent PLMN List",
        "# 0..3; Mobile Country Code 1..999; Mobile Network Code 100..901"},
    {"MRL_GSM", "Mobility/Process CO", "MM Service State *6; MM State *9"},
    {"MRL_GSM", "Mobility/Process CS",
        "LU Reject Cause *3; MM Service State *6; MM State *9; MM Sub State *6"},
    {"MRL_GSM", "Mobility/Process PS",
        "Attach Reject Cause *2; MM Service State *6; MM State *7; MM Sub State *7"},
    {"MRL_GSM", "Mobility/Serving PLMN",
        "Location Area Code 5120..6215; Mobile Country Code 1..999; Mobile Network Code 1..100; PLMN "
        "Sel Mod *3; Routing Area Code 4..17; Service Type *4"},
    {"MRL_GSM", "Neighbors/GSM Set",
        "# 0..32; ARFCN 1..60; BSIC 0..63; RSSI -103..-67; Ranking Value -109..-73"},
    {"MRL_GSM", "Neighbors/Neighboring Cells",
        "# 0..32; ARFCN 1..60; BSIC 0..63; C1 Value 1..39; RSSI -100..103"},
    {"MRL_GSM", "Neighbors/UMTS Set",
        "# 0..48; Downlink Frequency 10563..10588; Energy Per Chip -24..-3.5; Energy Per Chip ~-20.000000; "
        "RSCP -112..-65; Rank Cell RSCP -114..-74; Ranking Value -114..-74; Scrambling Code 8..507; "
        "UARFCN 10563..10588"},
    {"MRL_GSM", "Packet Data/GPRS Information",
        "Access Burst Type *2; Cell Reselect Hysteresis *2; Count HR 0..14; Count LR 0..15; DRX Timer "
        "Max 1..4; Ext Measurement Order *1; Network Control Order *2; Network Operating Mode *2; "
        "PBCCH Present 0..1; PFC Supported *2; Packet PSI Status 0..1; Packet SI Status *2; Priority "
        "Access Threshold *3; SI13 Position *2; T3192 0..1500"},
    {"MRL_GSM", "Packet Data/HSDPA Info", "Carrier Info *3; Sub Frames 0..250; Version 1..1"},
    {"MRL_GSM", "Packet Data/HSDPA Info/Primary HARQ Process",
        "# 0..16; Block Errors 0..46; New Tx 1..420; No Rx Bits 19400..8015180; Process ID 0..15"},
    {"MRL_GSM", "Packet Data/HSDPA Info/Secondary HARQ Process",
        "# 0..8; Block Errors 0..18; New Tx 1..147; No Rx Bits 19773..2880350; Process ID 0..7"},
    {"MRL_GSM", "Packet Data/PDP Context Info", "# 0..2; Context ID 5..6; QCI 5..9; State *2"},
    {"MRL_GSM", "Serving/Active Set",
        "# 0..4; Energy Per Chip -25..-3; RSCP -106..-58; Scrambling Code 9..452"},
    {"MRL_GSM", "Serving/BLER/Transport Channels",
        "# 0..3; CRC Received 20..1165; CRC Received in Error 0..20; Transport Channel ID 1..24"},
    {"MRL_GSM", "Serving/BLER", "Window Size 100..100"},
    {"MRL_GSM", "Serving/GSM RR Info",
        "DRX Used 1..4; DTX Used *2; RR Mode *2; RR State *9; RR Status 0..2; RR Sub State *4; Rx "
        "Quality Full 0..57; Rx Quality Sub 0..63; Serving Rx Level 47..110"},
    {"MRL_GSM", "Serving/GSM Serving Cell",
        "ARFCN 1..56; BSIC 3..60; C1 Value 0..57; C2 Value 0..63; Cell ID 2001..2142; MA Dedicated "
        "ARFCN 64..95; RSSI 47..110"},
    {"MRL_GSM", "Serving/Mobile Allocation", "ARFCNs 64..95; HSN 1..61"},
    {"MRL_GSM", "Serving/Mobile Allocation/ARFCNs", "# 0..8"},
    {"MRL_GSM", "Serving/UMTS RR Info",
        "Cell ID 20844559..20845120; Ciphering *2; Downlink Frequency 10563..10588; RRC State *6; "
        "Scrambling Code 9..452; Transmit Power -25.8..9.5; UARFCN 10563..10588; URA ID 31..32; "
        "Uplink Frequency 9613..9638"},
    {"MRL_LTE", "Connected mode LTE Intra-frequency Measurement",
        "E-ARFCN 1300..6300; Serving Filtered RSRP -130.2..-58.2; Serving Filtered RSRQ -19.5..-7.8; "
        "Serving Physical Cell ID 7..238; Subframe Number 0..9"},
    {"MRL_LTE", "Detected Cells", "# 0..17; Physical Cell ID 7..502"},
    {"MRL_LTE", "Measured Neighbor Cells",
        "# 0..32; Filtered RSRP -135.5..-60.5; Filtered RSRQ -20..-9.4; Physical Cell ID 7..502"},
    {"MRL_LTE", "Neighbor Cells List",
        "# 0..32; Ant 0 Frame Offset 0..1022; Ant 0 Sample Offset 326..307127; Average RSRP "
        "-137..-63; Average RSRQ -20..-7.8; Frequency Offset 0..40; Measured RSRP -122..-56.5; "
        "Measured RSRQ -20..-7.8; Measured RSSI -93..-27; Physical Cell ID 7..502; Srxlev 6..71"},
    {"MRL_LTE", "Neighbor Measurements", "E-ARFCN 1300..6300; Qrxlevmin -128..-128; Version 1..1"},
    {"MRL_LTE", "Reselection Candidates List",
        "# 0..9; ARFCN 1..70; BSIC ID 0..58; Band 0..6; Candidate Priority 1..6; Candidate RAT Type "
        "*5; Cell ID 0..502; Channel 3..1300; E ARFCN 1..6300; PSC 0..461; Pilot 0..64256; U ARFCN "
        "2..10613"},
    {"MRL_LTE", "Reselection Candidates", "Serving Cell ID 7..502; Serving EARFCN 1300..6300; Version 1..1"},
    {"MRL_LTE", "Serving Cell Info",
        "Cell Identity 10322200..10345700; Download Bandwidth *2; Download Frequency 1300..6300; Freq "
        "Band Indicator 3..20; Num Tx Antennas 2..4; Physical Cell ID 7..502; Tracking Area Code "
        "4301..4302; UARFCN 1300..6300; Upload Bandwidth *2; Upload Frequency 19300..24300"},
    {"MRL_LTE", "Serving Cell Measurements",
        "Average RSRP -122..-56.2; Average RSRQ -19.8..-7.8; E-ARFCN 1300..6300; Max UE Tx Power "
        "23..23; Measured RSRP -140..-52.2; Measured RSRQ -20..-7.8; Measured RSSI -100..-27.5; "
        "Measurement Rules 1..3; Measurement Rules Updated *2; Num of Consecutive DRX Cycles of S < 0 "
        "0..0; P_Max *2; Physical Cell ID 7..502; Qrxlevmin -128..-128; S Intra Search *2; S Non "
        "Intra Search 36..36; Serving Layer Priority 4..6; Srxlev 6..72; Version 1..1"},
    {"MRL_UTRAN2", "CCTRCH SIR", "# 0..15; CCTRCH ID 1..15; SIR 0..58; TSNUM 0..6"},
    {"MRL_UTRAN2", "CCTRCH SIR/SIR", "# 6..6"},
    {"MRL_UTRAN2", "Neighbor Cell List",
        "# 0..32; Cell ID 1..127; Filter RSCP 0.1..0.7; Status *3; UARFCN 10055..10071; inJDCS *2"},
    {"MRL_UTRAN2", "RRC Info", "State *7"},
    {"MRL_UTRAN2", "Serving Cell Info",
        "Allowed Access *1; Cell Access Restrictions 0..0; Cell ID 13896732..13897082; Cell "
        "Scrambling Code 5..120; Downlink UARFCN 10055..10071; Freq Band Indicator 34..34; Local Area "
        "Code 5120..5121; URA ID 12..13; Uplink UARFCN 10055..10071"},
    {"MRL_UTRAN2", "TRCH BLER", "# 0..63; TRCH BLER Measurement 0..63; TRCH ID 1..63"},
    {"MRL_CDMA", "1x Active Set/Pilots", "Pilot -27.7..-7; Pilot ~(ref"},
    {"MRL_CDMA", "1x Status",
        "Device State *5; Rx0 AGC -104.7..-38.5; Rx0 Band Class *2; Rx0 Channel 283..425; Rx1 AGC "
        "-106..-41.5; Rx1 Band Class *3; Rx1 Channel 283..425; Traffic FER 0..13.8; Tx AGC -33.4..23"},
    {"MRL_CDMA", "1x System Identity",
        "Base Station ID 2049..2194; Network ID 7..65535; Packet Zone ID 1..3; Protocol Revision "
        "6..6; Roaming Indicator *3; System ID 4106..5213"},
    {"MRL_CDMA", "EV-DO Active Set/Pilots", "Pilot -21.1..0"},
    {"MRL_CDMA", "EV-DO Fingers/Carrier to Interference", "Pilot -21.1..13"},
    {"MRL_CDMA", "EV-DO Session", "Color Code 0..40; Session State *5; UATI, Low 24 Bits 0..8769540"},
    {"MRL_CDMA", "EV-DO Status",
        "Band Class *2; Channel 466..675; Device State *6; Forward Link Rate 0..2230; Reverse Link "
        "Rate 0..360; Rx AGC 0 -105..-39; Rx AGC 1 -108..-42; Serving PN Offset 12..492; Tx AGC "
        "-34..23"},
    {"IFX", "Mobility/Cell Changes", "# 0..8; From 2057..13896800; Time 15.5..594.7; To 2057..13896800"},
    {"IFX", "Mobility", "Forbidden Networks 1..1"},
    {"IFX", "Mobility/Forbidden Networks", "# 2..2"},
    {"IFX", "Mobility/State", "GMM *2; Location Updates 1..3; MM *2"},
    {"IFX", "Neighbours/GSM", "# 0..8; BSIC 0..7; C1 2..47; Carrier 10..123; RxLev -104..-59"},
    {"IFX", "Neighbours/UMTS",
        "# 0..4; Carrier 10588..10588; EcN0 -23.9..-6; RSCP -104..-56; Scrambling Code 9..297"},
    {"IFX", "Radio Resources", "Since 0..13; State *8"},
    {"IFX", "Serving Cell",
        "Area 5120..5121; BSIC 0..7; C1 -9..56; Carrier 10..10588; Cell 2057..13896800; EcN0 "
        "-18.5..-6; Network 1..1; RSCP -115..-33; RxLev -115..-50; Scrambling Code 9..297; Technology "
        "*2; Transmit Power -38..24"},
    {"IFX", "Timing", "Frame 0..128700; Frequency Error -90..61; Timing Advance 0..2"},
};

void expectShown(const Seen& seen, const std::string& expected)
{
    if (expected[0] == '*') {
        EXPECT_EQ(seen.texts.size(), std::stoul(expected.substr(1)));
        return;
    }
    if (expected[0] == '~') {
        EXPECT_TRUE(std::ranges::any_of(seen.texts,
            [&](const std::string& text) { return text.find(expected.substr(1)) != std::string::npos; }));
        return;
    }
    const double least = std::stod(expected);
    const double most = std::stod(expected.substr(expected.find("..") + 2));
    const double tolerance = 0.02 * (most - least) + 0.05;
    EXPECT_NEAR(seen.least, least, tolerance);
    EXPECT_NEAR(seen.most, most, tolerance);
}

TEST(EveryScenario, FillsEverySectionWithBelievableRows)
{
    for (const ScenarioEntry& entry : scenarioTable()) {
        test::Decoding decoding(entry.technology);
        SeenByPath seen;
        for (const auto& [due, message] : itemsOf(entry, 600s)) {
            decoding.feed(message.bytes);
            noteShown(seen, "", decoding.display());
        }
        for (const auto& [technology, section, rows] : kShown) {
            if (std::string_view(technology) != entry.technology)
                continue;
            std::istringstream stream(rows);
            for (std::string row; std::getline(stream, row, ';');) {
                row.erase(0, row.find_first_not_of(' '));
                const auto space = row.rfind(' ');
                const std::string path = text("/%s/%s", section, row.substr(0, space).c_str());
                SCOPED_TRACE(entry.technology + path);
                ASSERT_TRUE(seen.contains(path));
                expectShown(seen[path], row.substr(space + 1));
            }
        }
        std::set<std::string> silent;
        for (const auto& [path, each] : seen) {
            if (each.isSilent())
                silent.insert(path);
            for (const std::string& text : each.texts)
                EXPECT_TRUE(text.find("nan") == std::string::npos && text.find("inf") == std::string::npos)
                    << path << ' ' << text;
        }
        const std::map<std::string, std::set<std::string>> neverFilled = {
            {"MRL_GSM",
                {"/Neighbors/Detected Set/#", "/Neighbors/Monitored Set/#",
                    "/Neighbors/Virtual Active Set/#"}},
            {"MRL_UTRAN2", {"/GSM Neighbor Cell List/#"}},
        };
        const auto expected = neverFilled.find(entry.technology);
        EXPECT_EQ(silent, expected == neverFilled.end() ? std::set<std::string>() : expected->second);
    }
}

TEST(EveryScenario, DependsOnItsSeedAloneAndSendsEveryCodeWithinAMinuteInOrder)
{
    for (const ScenarioEntry& entry : scenarioTable()) {
        const auto codes = entry.make({})->codes();
        std::set<Bytes> drives;
        for (const std::uint64_t seed : {1U, 2U, 3U, 1U}) {
            std::set<LogCode> seen;
            Bytes drive;
            Microseconds last{0};
            for (const auto& [due, message] : itemsOf(entry, 60s, seed)) {
                ASSERT_GE(due, last);
                last = due;
                drive.insert(drive.end(), message.bytes.begin(), message.bytes.end());
                if (!message.code)
                    continue;
                seen.insert(*message.code);
                const PacketReader packet(message.bytes);
                const auto stamp = packet.u32(5) | static_cast<std::uint64_t>(packet.u32(9)) << 32;
                ASSERT_EQ(stamp, static_cast<std::uint64_t>((kStart + due).count()));
            }
            EXPECT_EQ(seen, std::set(codes.begin(), codes.end())) << entry.technology << " seed " << seed;
            EXPECT_GT(last, 59s);
            drives.insert(drive);
        }
        EXPECT_EQ(drives.size(), 3U) << entry.technology;
    }
}

} // namespace
} // namespace orvex::korat
