// Which sections a technology has, where its template lays them out, and which packets each of them takes.

#include "GSM/MRL_GSMLogGenerator.h"
#include "LTE/LTELogGenerator.h"
#include "UTRAN/UTRANLogGenerator.h"

#include "SectionCases.h"

#include "FileStorage.h"

#include <algorithm>
#include <set>

namespace orvex::test {
namespace {

enum class OtherCodes { reported, ignored };

struct Taken {
    LogCode code;
    std::size_t minimumLength = 0; // 0: not refused for its length
};

struct SectionPlan {
    const char* name;
    std::vector<Taken> packets;
    const char* entryLine;
    OtherCodes otherCodes = OtherCodes::reported;
};

constexpr Taken kFiles{0xFF0000};
constexpr Taken kCells{0xFF0001};
constexpr Taken kContexts{0xFF0002};
constexpr OtherCodes ignored = OtherCodes::ignored;

// What each technology shows, in its sections' order of creation. That is the order in which a packet wanted
// by several reaches them.
const std::vector<SectionPlan> kLTE = {
    {"Serving Cell Info", {{0xB0C2, 38}, {0xB0C1, 22}, kCells}, "<4>LTE Serving Cell Info"},
    {"Connected mode LTE Intra-frequency Measurement", {{0xB179, 29}},
        "<4>Connected mode LTE Intra-frequency Measurement"},
    {"Measured Neighbor Cells", {{0xB179, 29}}, "<4>Measured Neighbor Cells"},
    {"Detected Cells", {{0xB179, 29}}, "<4>Detected Cells"},
    {"Serving Cell Measurements", {{0xB17F, 33}}, "<4>Serving Cell Measurements"},
    {"Neighbor Measurements", {{0xB180, 21}}, "<4>Neighbor Measurements"},
    {"Neighbor Cells List", {{0xB180, 21}}, "<4>Neighbor Cells List"},
    {"Reselection Candidates", {{0xB186, 21}}, "<4>Reselection Candidates"},
    {"Reselection Candidates List", {{0xB186, 21}}, "<4>Reselection Candidates List"},
    {"SIM Info", {kFiles}, "<4>SimInfo", ignored},
    {"PDP Context Info", {kContexts}, nullptr},
};

const std::vector<SectionPlan> kUTRAN = {
    {"RRC Info", {{0xD0E0}}, "<4>RRC Info", ignored},
    {"Serving Cell Info", {{0xD0E2, 26}, kCells}, "<4>Serving Cell Info", ignored},
    {"Neighbor Cell List", {{0xD00A, 21}}, "<4>NeighbhorMeasurements List", ignored},
    {"GSM Neighbor Cell List", {{0xD00E, 17}}, "<4>GSM Neighbor Cell List", ignored},
    {"TRCH BLER", {{0xD00C, 17}}, "<5>TRCH BLER Measurement", ignored},
    {"CCTRCH SIR", {{0xD00C, 17}}, "<4>CCTRCH SIR Measurement", ignored},
    {"PDP Context Info", {kContexts}, nullptr},
    {"SIM Info", {kFiles}, "<4>SimInfo", ignored},
};

// Process CO goes by the name of Process CS in the log, Coding Scheme by that of Cell Change Counters.
const std::vector<SectionPlan> kGSM = {
    {"Active Set", {{0x417A, 16}}, "<4>ActiveSet"},
    {"Coding Scheme", {}, "<4>CellChangeCounters", ignored},
    {"GPRS Information",
        {{0x51F5, 18}, {0x7135, 32}, {0x51F6, 24}, {0x51FB, 34}, {0x51FD, 35}, {0x51F4, 15}, {0x5137, 29}},
        "<4>GPRSInformation"},
    {"GSM Serving Cell", {{0x5134, 26}, {0x5137, 29}, {0x5076, 17}, kCells}, "<4>GSMServingCell"},
    {"Mobile Allocation", {{0x51F8, 15}}, "<4>MobileAllocation"},
    {"Neighboring Cells", {{0x5137, 29}, {0x51FF, 15}, kCells}, "<4>NeighboringCells"},
    {"PDP Context Info", {kContexts}, nullptr},
    {"Process PS", {{0x7130, 16}, {0x7132, 16}}, "<4>ProcessPS"},
    {"UMTS RR Measurement", {}, "<4>UMTSRRMeasurement", ignored},
    {"Cell Change Counters", {}, "<4>CellChangeCounters", ignored},
    {"Detected Set", {{0x417A, 16}}, "<4>DetectedSet"},
    {"GSM Set", {{0x4005, 15}}, "<4>GSMSet"},
    {"Non-Ranked GSM Set", {}, "<4>NonRankedGSMSet", ignored},
    {"Process CO", {{0x7131, 16}, {0x7132, 16}}, "<4>ProcessCS"},
    {"Serving PLMN", {{0x7135, 32}, {0x7132, 16}, kCells}, "<4>Serving PLMN"},
    {"UMTS Set", {{0x4005, 15}, kCells}, "<4>UMTSSet"},
    {"Equivalent PLMN List", {{0x7150, 17}}, "<4>Equivalent PLMN List"},
    {"GSM RR Info", {{0x512C, 17}, {0x5137, 29}, {0x5072, 20}, {0x51F6, 24}}, "<4>GSMRRInfo"},
    {"Monitored Set", {{0x417A, 16}}, "<4>MonitoredSet"},
    {"Non-Ranked UMTS Set", {}, "<4>NonRankedUMTSSet", ignored},
    {"Process CS", {{0x7131, 16}, {0x7132, 16}}, "<4>ProcessCS"},
    {"UMTS RR Info", {{0x4125, 14}, {0x4031, 16}, {0x4127, 29}, {0x4157, 19}, kCells}, "<4>UMTSRRInfo"},
    {"BLER", {{0x4116, 16}}, "<4>BLER"},
    {"Virtual Active Set", {{0x417A, 16}}, "<4>VirtualActiveSet"},
    {"SIM Info", {kFiles}, "<4>SimInfo", ignored},
    {"HSDPA Info", {{0x4221, 18}}, "<4>HSDPA Info", ignored},
};

struct Technology {
    std::string templateName;
    std::unique_ptr<const ClassIndex> index;
    const std::vector<SectionPlan>& plan;
};

std::vector<Technology> technologies()
{
    std::vector<Technology> all;
    all.push_back({"LTE", std::make_unique<LTEClassIndex>(), kLTE});
    all.push_back({"MRL_UTRAN2", std::make_unique<UTRANClassIndex>(), kUTRAN});
    all.push_back({"MRL_GSM", std::make_unique<MRL_GSMClassIndex>(), kGSM});
    return all;
}

// The sections of a template, those inside of groups too.
void collectSections(const ClassIndex& index, const Dictionary& display, std::multiset<std::string>& names)
{
    for (const auto& [name, entry] : display) {
        if (index.getClass(name)) {
            names.insert(name);
        } else {
            ASSERT_TRUE(entry.dictionary()) << name << " is neither section nor group";
            collectSections(index, *entry.dictionary(), names);
        }
    }
}

TEST(SectionPlan, ClassIndexAndTemplateNameTheSameSections)
{
    const QuietConsole quiet;
    for (const auto& [templateName, index, plan] : technologies()) {
        std::multiset<std::string> laidOut;
        const FileResources resources(ORVEX_SOURCE_DIR "/resources");
        collectSections(*index, *resources.dictionaryNamed(templateName).dictionary, laidOut);
        std::multiset<std::string> planned;
        std::map<LogCode, std::vector<const Base*>> wanted;
        for (const auto& [name, packets, entryLine, otherCodes] : plan) {
            planned.insert(name);
            std::vector<LogCode> codes;
            for (const auto& [code, minimumLength] : packets) {
                codes.push_back(code);
                wanted[code].push_back(index->getClass(name));
            }
            EXPECT_EQ(index->getClass(name)->getLogCodeArray(), codes) << name;
        }
        EXPECT_EQ(laidOut, planned) << templateName;
        EXPECT_EQ(index->getAllLogCodes().size(), wanted.size());
        for (const auto& [code, sections] : wanted) {
            ASSERT_NE(index->getSubscribers(code), nullptr) << code;
            EXPECT_TRUE(std::ranges::equal(*index->getSubscribers(code), sections)) << code;
        }
    }
}

// What a section logs for one packet, and whether it changed anything.
std::pair<std::vector<std::string>, bool> reactionTo(Base& section, LogCode code, std::size_t length)
{
    const auto display = Dictionary::make();
    const auto records = Array::make({"kept"});
    std::vector<std::string> lines;
    for (const Value& container : {Value(display), Value(records)}) {
        section.updateSectionRef(container);
        RecordingLog log;
        section.updateWithData(Bytes(length, 0xFF), code);
        lines = log.take();
    }
    return {lines, !display->isEmpty() || *records != Array({"kept"})};
}

TEST(SectionPlan, SectionsRefusePacketsThatAreNotForThem)
{
    const QuietConsole quiet;
    for (const auto& [templateName, index, plan] : technologies()) {
        for (const auto& [name, packets, entryLine, otherCodes] : plan) {
            if (!entryLine)
                continue; // takes any code
            Base& section = *index->getClass(name);
            std::vector<std::string> expected = {entryLine};
            for (const auto& [code, minimumLength] : packets) {
                if (minimumLength == 0 || code == 0x51FF) // which is only remembered
                    continue;
                EXPECT_EQ(reactionTo(section, code, minimumLength - 1), std::pair(expected, false)) << name;
                EXPECT_TRUE(reactionTo(section, code, minimumLength).second) << name << ' ' << code;
            }
            if (otherCodes == OtherCodes::reported)
                expected.emplace_back("<3>Received an unknown log message: 4660");
            EXPECT_EQ(reactionTo(section, 0x1234, 400), std::pair(expected, false)) << name;
        }
    }
}

} // namespace
} // namespace orvex::test
