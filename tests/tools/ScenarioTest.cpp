#include "scenarios/ScenarioTable.h"

#include "packets/ExtraPacket.h"

#include "Decoding.h"

#include "LTE/LogCode_0xB179.h"
#include "LTE/LogCode_0xB17F.h"
#include "LTE/LogCode_0xB180.h"
#include "LTE/LogCode_0xB186.h"
#include "PropertyList.h"
#include "UTRAN/LogCode_0xD00A.h"
#include "UTRAN/LogCode_0xD00C.h"
#include "UTRAN/LogCode_0xD00E.h"

#include <gmock/gmock.h>

#include <chrono>
#include <map>
#include <set>

namespace orvex::korat {

void PrintTo(const ScenarioEntry& entry, std::ostream* stream)
{
    *stream << entry.technology << ' ' << entry.name;
}

namespace {

using namespace std::chrono_literals;
using testing::AllOf;
using testing::Ge;
using testing::Le;

// Forth and back along the road.
constexpr Microseconds kWholeDrive = 600s;

std::vector<Scenario::Item> itemsOf(
    const ScenarioEntry& entry, Microseconds duration, const ScenarioSettings& settings = {})
{
    std::vector<Scenario::Item> items;
    const auto scenario = entry.make(settings);
    for (auto item = scenario->next(); item.due <= duration; item = scenario->next())
        items.push_back(std::move(item));
    return items;
}

class EveryScenario : public testing::TestWithParam<ScenarioEntry> { };

INSTANTIATE_TEST_SUITE_P(, EveryScenario, testing::ValuesIn(scenarioTable()),
    [](const auto& each) { return std::string(each.param.technology) + "_" + each.param.name; });

TEST_P(EveryScenario, DependsOnItsSeedAlone)
{
    const auto bytesOf = [](const std::vector<Scenario::Item>& items) {
        Bytes all;
        for (const auto& item : items)
            all.insert(all.end(), item.message.bytes.begin(), item.message.bytes.end());
        return all;
    };
    const Bytes first = bytesOf(itemsOf(GetParam(), 60s, {7, {}}));
    EXPECT_TRUE(first == bytesOf(itemsOf(GetParam(), 60s, {7, {}})));
    EXPECT_FALSE(first == bytesOf(itemsOf(GetParam(), 60s, {8, {}})));
}

TEST_P(EveryScenario, SendsEveryCodeWithinAMinute)
{
    for (const std::uint64_t seed : {1U, 2U, 3U}) {
        std::set<LogCode> seen;
        for (const auto& item : itemsOf(GetParam(), 60s, {seed, {}}))
            seen.insert(item.message.code);
        const auto codes = GetParam().make({})->codes();
        EXPECT_EQ(seen, std::set<LogCode>(codes.begin(), codes.end())) << "seed " << seed;
    }
}

TEST_P(EveryScenario, StampsItsMessagesInOrder)
{
    constexpr Microseconds kStart{1'700'000'000'000'000};
    Microseconds last{0};
    for (const auto& item : itemsOf(GetParam(), 60s, {1, kStart})) {
        ASSERT_GE(item.due, last);
        last = item.due;
        const PacketReader packet(item.message.bytes);
        const auto stamp = packet.u32(5) | static_cast<std::uint64_t>(packet.u32(9)) << 32;
        ASSERT_EQ(stamp, static_cast<std::uint64_t>((kStart + item.due).count()));
    }
    EXPECT_GT(last, 59s);
}

TEST_P(EveryScenario, ExtraPacketsCarryTextsAndCellsWithNumbers)
{
    for (const auto& item : itemsOf(GetParam(), 120s)) {
        if (item.message.code < kExtraCodes)
            continue;
        const auto parsed = propertyListFromData(std::span(item.message.bytes).subspan(13));
        ASSERT_TRUE(parsed.value) << parsed.error;
        if (item.message.code == kSimFilesCode) {
            EXPECT_EQ(parsed.value->dictionary()->size(), 14U);
            for (const auto& [key, value] : *parsed.value->dictionary())
                EXPECT_TRUE(value.string()) << key;
        } else if (item.message.code == kPDPContextsCode) {
            for (const Value& context : *parsed.value->array()) {
                for (const auto& [key, value] : *context.dictionary())
                    EXPECT_TRUE(value.string()) << key;
            }
        } else {
            ASSERT_GE(parsed.value->array()->size(), 1U);
            EXPECT_EQ((*(*parsed.value->array())[0].dictionary())["CellType"], Value("Serving"));
            EXPECT_TRUE((*(*parsed.value->array())[0].dictionary())["UARFCN"].integer());
        }
    }
}

TEST_P(EveryScenario, GeneratorDecodesAWholeDrive)
{
    test::Decoding decoding(GetParam().technology);
    const auto items = itemsOf(GetParam(), kWholeDrive);
    for (const auto& item : items)
        decoding.feed(item.message.bytes);
    EXPECT_EQ(decoding.rows("SIM Info").at(0).size(), 14U);
    EXPECT_EQ(decoding.rows("PDP Context Info").size(), 2U);
    EXPECT_GE(decoding.rows("Serving Cell Info").at(0).size(), 6U);
}

// The least and the most of each measure over a drive.
class Extremes {
public:
    void note(const char* measure, double value)
    {
        auto [found, isNew] = _ranges.try_emplace(measure, value, value);
        found->second.first = std::min(found->second.first, value);
        found->second.second = std::max(found->second.second, value);
    }
    template <typename Records>
    void noteCount(const char* measure, const Records& records)
    {
        double count = 0;
        for ([[maybe_unused]] const auto& record : records)
            ++count;
        EXPECT_EQ(count, static_cast<double>(records.count())) << measure << " that end early";
        note(measure, count);
    }
    double least(const char* measure) const { return _ranges.at(measure).first; }
    double most(const char* measure) const { return _ranges.at(measure).second; }

private:
    std::map<std::string, std::pair<double, double>> _ranges;
};

TEST(LTETownScenario, ValuesAreBelievableAndListsReachTheirEnds)
{
    Extremes seen;
    std::set<int> technologies;
    std::set<int> servingCells;
    for (const auto& item : itemsOf(*findScenario("MRL_LTE", "town"), kWholeDrive)) {
        const Bytes& bytes = item.message.bytes;
        switch (item.message.code) {
        case 0xB179: {
            const LogCode_0xB179 report(bytes);
            servingCells.insert(report.servingPhysicalCellIdentity());
            seen.note("RSRP", report.servingFilteredRSRP());
            seen.note("RSRQ", report.servingFilteredRSRQ());
            seen.noteCount("measured", report.measuredNeighbors());
            seen.noteCount("detected", report.detectedCells());
            for (const auto& neighbor : report.measuredNeighbors()) {
                seen.note("neighbour RSRP", neighbor.filteredRSRP());
                seen.note("neighbour RSRQ", neighbor.filteredRSRQ());
            }
            break;
        }
        case 0xB17F: {
            const LogCode_0xB17F report(bytes);
            seen.note("RSRP", report.measuredRSRP());
            seen.note("RSRQ", report.measuredRSRQ());
            // N times RSRP over RSSI is RSRQ; 6 to 100 resource blocks are 8 to 20 dB.
            seen.note(
                "RSSI - RSRP + RSRQ", report.measuredRSSI() - report.measuredRSRP() + report.measuredRSRQ());
            EXPECT_NEAR(report.srxlev(), report.averageRSRP() - report.qRxLevMin(), 1);
            break;
        }
        case 0xB180: {
            const LogCode_0xB180 report(bytes);
            seen.noteCount("neighbours", report.neighborCells());
            for (const auto& cell : report.neighborCells()) {
                seen.note("neighbour RSRP", cell.measuredRSRP());
                seen.note("neighbour RSRQ", cell.averageRSRQ());
            }
            break;
        }
        case 0xB186: {
            const LogCode_0xB186 report(bytes);
            seen.noteCount("candidates", report.candidates());
            for (const auto& candidate : report.candidates())
                technologies.insert(candidate.technology());
            break;
        }
        default: break;
        }
    }
    for (const char* measure : {"RSRP", "neighbour RSRP"}) {
        EXPECT_THAT(seen.least(measure), AllOf(Ge(-140), Le(-105))) << measure;
        EXPECT_THAT(seen.most(measure), AllOf(Ge(-95), Le(-44))) << measure;
    }
    for (const char* measure : {"RSRQ", "neighbour RSRQ"}) {
        EXPECT_GE(seen.least(measure), -20) << measure;
        EXPECT_LE(seen.most(measure), -3) << measure;
        EXPECT_GT(seen.most(measure) - seen.least(measure), 3) << measure;
    }
    EXPECT_GE(seen.least("RSSI - RSRP + RSRQ"), 16);
    EXPECT_LE(seen.most("RSSI - RSRP + RSRQ"), 21);
    EXPECT_EQ(seen.least("measured"), 0);
    EXPECT_EQ(seen.most("measured"), 32);
    EXPECT_EQ(seen.least("detected"), 0);
    EXPECT_GE(seen.most("detected"), 4);
    EXPECT_EQ(seen.least("neighbours"), 1);
    EXPECT_EQ(seen.most("neighbours"), 32);
    EXPECT_EQ(seen.least("candidates"), 0);
    EXPECT_GE(seen.most("candidates"), 4);
    EXPECT_EQ(technologies, (std::set{0, 1, 2, 3, 4}));
    EXPECT_GE(servingCells.size(), 8U);
}

TEST(UTRANTownScenario, ListsReachTheirEnds)
{
    Extremes seen;
    std::set<int> states;
    std::set<int> sets;
    for (const auto& item : itemsOf(*findScenario("MRL_UTRAN2", "town"), kWholeDrive)) {
        const Bytes& bytes = item.message.bytes;
        switch (item.message.code) {
        case 0xD0E0: states.insert(bytes[13] == 1 ? bytes[14] : 255); break;
        case 0xD00A: {
            const LogCode_0xD00A report(bytes);
            seen.noteCount("neighbours", report.neighbors());
            for (const auto& neighbor : report.neighbors()) {
                seen.note("UARFCN", neighbor.uarfcn());
                seen.note("RSCP", neighbor.filteredRSCP());
                sets.insert(neighbor.status());
            }
            break;
        }
        case 0xD00E: {
            const LogCode_0xD00E report(bytes);
            seen.noteCount("GSM neighbours", report.neighbors());
            for (const auto& neighbor : report.neighbors())
                seen.note("GSM RSSI", neighbor.rssi());
            break;
        }
        case 0xD00C: {
            const LogCode_0xD00C report(bytes);
            seen.noteCount("TRCH", report.transportChannels());
            seen.noteCount("CCTRCH", report.compositeChannels());
            for (const auto& channel : report.transportChannels())
                seen.note("BLER", channel.blockErrorRate());
            for (const auto& channel : report.compositeChannels())
                seen.note("SIR", channel.sir(5));
            break;
        }
        default: break;
        }
    }
    const struct {
        const char* measure;
        double least;
        double most;
    } counts[] = {{"neighbours", 0, 32}, {"GSM neighbours", 0, 32}, {"TRCH", 0, 63}, {"CCTRCH", 0, 15},
        {"BLER", 0, 63}, {"UARFCN", 10055, 10071}};
    for (const auto& [measure, least, most] : counts) {
        EXPECT_EQ(seen.least(measure), least) << measure;
        EXPECT_EQ(seen.most(measure), most) << measure;
    }
    EXPECT_GE(seen.least("GSM RSSI"), -110);
    EXPECT_LE(seen.most("GSM RSSI"), -47);
    EXPECT_LE(seen.most("SIR"), 63);
    EXPECT_GT(seen.most("RSCP"), 0.3);
    EXPECT_EQ(states, (std::set{0, 1, 2, 3, 4, 5, 255}));
    EXPECT_EQ(sets, (std::set{0, 1, 2, 3}));
}

} // namespace
} // namespace orvex::korat
