#include "packets/ExtraPacket.h"

#include "Decoding.h"
#include "Drive.h"
#include "ScenarioItems.h"

#include "LTE/LogCode_0xB179.h"
#include "LTE/LogCode_0xB17F.h"
#include "LTE/LogCode_0xB180.h"
#include "LTE/LogCode_0xB186.h"
#include "PropertyList.h"
#include "UTRAN/LogCode_0xD00A.h"
#include "UTRAN/LogCode_0xD00C.h"
#include "UTRAN/LogCode_0xD00E.h"

#include <gtest/gtest.h>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

TEST(EveryScenario, DependsOnItsSeedAloneAndSendsEveryCodeWithinAMinute)
{
    for (const ScenarioEntry& entry : scenarioTable()) {
        const auto codes = entry.make({})->codes();
        std::set<Bytes> drives;
        for (const std::uint64_t seed : {1U, 2U, 3U, 1U}) {
            std::set<LogCode> seen;
            Bytes drive;
            for (const auto& [due, message] : itemsOf(entry, 60s, seed)) {
                if (message.code)
                    seen.insert(*message.code);
                drive.insert(drive.end(), message.bytes.begin(), message.bytes.end());
            }
            EXPECT_EQ(seen, std::set(codes.begin(), codes.end())) << entry.technology << " seed " << seed;
            drives.insert(drive);
        }
        EXPECT_EQ(drives.size(), 3U) << entry.technology;
    }
}

TEST(EveryScenario, StampsItsMessagesInOrder)
{
    for (const ScenarioEntry& entry : scenarioTable()) {
        Microseconds last{0};
        for (const auto& [due, message] : itemsOf(entry, 60s)) {
            ASSERT_GE(due, last);
            last = due;
            if (!message.code)
                continue;
            const PacketReader packet(message.bytes);
            const auto stamp = packet.u32(5) | static_cast<std::uint64_t>(packet.u32(9)) << 32;
            ASSERT_EQ(stamp, static_cast<std::uint64_t>((kStart + due).count()));
        }
        EXPECT_GT(last, 59s);
    }
}

Value extraOf(const Bytes& bytes)
{
    const auto parsed = propertyListFromData(std::span(bytes).subspan(13));
    EXPECT_TRUE(parsed.value) << parsed.error;
    return parsed.value.value_or(Value());
}

void expectTexts(const Value& dictionary)
{
    for (const auto& [key, value] : *dictionary.dictionary())
        EXPECT_TRUE(value.string()) << key;
}

// A drive on LTE or UTRAN, as the receiver's own readers tell it.
class DecodedDrive : public Drive {
public:
    using Drive::note;
    template <typename Records, typename Each>
    void noteList(const char* measure, const Records& records, Each noteRecord)
    {
        std::size_t count = 0;
        for (const auto& record : records) {
            noteRecord(record);
            ++count;
        }
        EXPECT_EQ(count, records.count()) << measure << " that end early";
        note(measure, static_cast<double>(count));
    }
    void note(const LogMessage& message);
};

void DecodedDrive::note(const LogMessage& message)
{
    const Bytes& bytes = message.bytes;
    switch (message.code.value_or(0)) {
    case 0xB179: {
        const LogCode_0xB179 report(bytes);
        kinds["serving cells"].insert(report.servingPhysicalCellIdentity());
        note("RSRP", report.servingFilteredRSRP());
        note("RSRQ", report.servingFilteredRSRQ());
        noteList("measured", report.measuredNeighbors(), [this](const auto& neighbor) {
            note("neighbour RSRP", neighbor.filteredRSRP());
            note("neighbour RSRQ", neighbor.filteredRSRQ());
        });
        noteList("detected", report.detectedCells(), [](const auto&) {});
        break;
    }
    case 0xB17F: {
        const LogCode_0xB17F report(bytes);
        note("RSRP", report.measuredRSRP());
        note("RSRQ", report.measuredRSRQ());
        // N times RSRP over RSSI is RSRQ; 6 to 100 resource blocks are 8 to 20 dB.
        note("RSSI - RSRP + RSRQ", report.measuredRSSI() - report.measuredRSRP() + report.measuredRSRQ());
        EXPECT_NEAR(report.srxlev(), report.averageRSRP() - report.qRxLevMin(), 1);
        break;
    }
    case 0xB180:
        noteList("neighbours", LogCode_0xB180(bytes).neighborCells(), [this](const auto& cell) {
            note("neighbour RSRP", cell.measuredRSRP());
            note("neighbour RSRQ", cell.averageRSRQ());
        });
        break;
    case 0xB186:
        noteList("candidates", LogCode_0xB186(bytes).candidates(),
            [this](const auto& candidate) { kinds["technologies"].insert(candidate.technology()); });
        break;
    case 0xD0E0: kinds["states"].insert(bytes[13] == 1 ? bytes[14] : 255); break;
    case 0xD00A:
        noteList("neighbours", LogCode_0xD00A(bytes).neighbors(), [this](const auto& neighbor) {
            note("UARFCN", neighbor.uarfcn());
            note("RSCP", neighbor.filteredRSCP());
            kinds["sets"].insert(neighbor.status());
        });
        break;
    case 0xD00E:
        noteList("GSM neighbours", LogCode_0xD00E(bytes).neighbors(),
            [this](const auto& neighbor) { note("GSM RSSI", neighbor.rssi()); });
        break;
    case 0xD00C: {
        const LogCode_0xD00C report(bytes);
        noteList("TRCH", report.transportChannels(),
            [this](const auto& channel) { note("BLER", channel.blockErrorRate()); });
        noteList("CCTRCH", report.compositeChannels(),
            [this](const auto& channel) { note("SIR", channel.sir(5)); });
        break;
    }
    case kSimFilesCode: expectTexts(extraOf(bytes)); break;
    case kPDPContextsCode: {
        const auto contexts = extraOf(bytes).array();
        for (const Value& context : *contexts)
            expectTexts(context);
        break;
    }
    case kCellMonitorCode: {
        const auto serving = (*extraOf(bytes).array())[0].dictionary();
        EXPECT_EQ((*serving)["CellType"], Value("Serving"));
        EXPECT_TRUE((*serving)["UARFCN"].integer());
        break;
    }
    default: break;
    }
}

TEST(TownScenarios, AreDecodedBelievableAndReachTheEndsOfTheirLists)
{
    const struct {
        const char* technology;
        std::vector<Range> ranges;
        std::map<std::string, std::set<int>> kinds;
    } cases[] = {
        {"MRL_LTE",
            {{"RSRP", {-140, -105}, {-95, -44}}, {"neighbour RSRP", {-140, -105}, {-95, -44}},
                {"RSRQ", {-20, -11}, {-8, -3}}, {"neighbour RSRQ", {-20, -11}, {-8, -3}},
                {"RSSI - RSRP + RSRQ", {16, 21}, {16, 21}}, {"measured", {0, 0}, {32, 32}},
                {"detected", {0, 0}, {4, 255}}, {"neighbours", {1, 1}, {32, 32}},
                {"candidates", {0, 0}, {4, 255}}},
            {{"technologies", {0, 1, 2, 3, 4}}}},
        {"MRL_UTRAN2",
            {{"neighbours", {0, 0}, {32, 32}}, {"GSM neighbours", {0, 0}, {32, 32}},
                {"TRCH", {0, 0}, {63, 63}}, {"CCTRCH", {0, 0}, {15, 15}}, {"BLER", {0, 0}, {63, 63}},
                {"UARFCN", {10055, 10055}, {10071, 10071}}, {"GSM RSSI", {-110, -47}, {-110, -47}},
                {"SIR", {0, 63}, {0, 63}}, {"RSCP", {0, 1}, {0.3, 1}}},
            {{"states", {0, 1, 2, 3, 4, 5, 255}}, {"sets", {0, 1, 2, 3}}}},
    };
    for (const auto& [technology, ranges, kinds] : cases) {
        DecodedDrive drive;
        test::Decoding decoding(technology);
        for (const auto& item : itemsOf(*findScenario(technology, "town"), 600s)) {
            drive.note(item.message);
            decoding.feed(item.message.bytes);
        }
        EXPECT_EQ(decoding.rows("SIM Info").at(0).size(), 14U);
        EXPECT_EQ(decoding.rows("PDP Context Info").size(), 2U);
        EXPECT_GE(decoding.rows("Serving Cell Info").at(0).size(), 6U);

        drive.expectRanges(ranges);
        if (const auto cells = drive.kinds.extract("serving cells")) {
            EXPECT_GE(cells.mapped().size(), 8U);
        }
        EXPECT_EQ(drive.kinds, kinds);
    }
}

} // namespace
} // namespace orvex::korat
