// Which sections a technology has, where its template lays them out, and which packets each of them takes.

#include "GSM/MRL_GSMClassIndex.h"
#include "LTE/LTEClassIndex.h"
#include "UTRAN/UTRANClassIndex.h"

#include "SectionCases.h"

#include "PropertyList.h"

#include <fstream>
#include <iterator>

namespace orvex::test {
namespace {

enum class Kind { rows, list };
enum class OtherCodes { reported, ignored };

struct Taken {
    LogCode code;
    std::size_t minimumLength = 0; // 0: not refused for its length
};

struct SectionPlan {
    const char* name;
    Kind kind;
    std::vector<Taken> packets;
    const char* entryLine;
    OtherCodes otherCodes = OtherCodes::reported;
};

constexpr Taken kFiles{0xFF0000};
constexpr Taken kCells{0xFF0001};
constexpr Taken kContexts{0xFF0002};
constexpr Kind rows = Kind::rows;
constexpr Kind list = Kind::list;
constexpr OtherCodes ignored = OtherCodes::ignored;

// What each technology shows, in its sections' order of creation. That is the order in which a packet wanted
// by several reaches them.
const std::vector<SectionPlan> kLTE = {
    {"Serving Cell Info", rows, {{0xB0C2, 38}, {0xB0C1, 22}, kCells}, "<4>LTE Serving Cell Info"},
    {"Connected mode LTE Intra-frequency Measurement", rows, {{0xB179, 29}},
        "<4>Connected mode LTE Intra-frequency Measurement"},
    {"Measured Neighbor Cells", list, {{0xB179, 29}}, "<4>Measured Neighbor Cells"},
    {"Detected Cells", list, {{0xB179, 29}}, "<4>Detected Cells"},
    {"Serving Cell Measurements", rows, {{0xB17F, 33}}, "<4>Serving Cell Measurements"},
    {"Neighbor Measurements", rows, {{0xB180, 21}}, "<4>Neighbor Measurements"},
    {"Neighbor Cells List", list, {{0xB180, 21}}, "<4>Neighbor Cells List"},
    {"Reselection Candidates", rows, {{0xB186, 21}}, "<4>Reselection Candidates"},
    {"Reselection Candidates List", list, {{0xB186, 21}}, "<4>Reselection Candidates List"},
    {"SIM Info", rows, {kFiles}, "<4>SimInfo", ignored},
    {"PDP Context Info", list, {kContexts}, nullptr},
};

const std::vector<SectionPlan> kUTRAN = {
    {"RRC Info", rows, {{0xD0E0}}, "<4>RRC Info", ignored},
    {"Serving Cell Info", rows, {{0xD0E2, 26}, kCells}, "<4>Serving Cell Info", ignored},
    {"Neighbor Cell List", list, {{0xD00A, 21}}, "<4>NeighbhorMeasurements List", ignored},
    {"GSM Neighbor Cell List", list, {{0xD00E, 17}}, "<4>GSM Neighbor Cell List", ignored},
    {"TRCH BLER", list, {{0xD00C, 17}}, "<5>TRCH BLER Measurement", ignored},
    {"CCTRCH SIR", list, {{0xD00C, 17}}, "<4>CCTRCH SIR Measurement", ignored},
    {"PDP Context Info", list, {kContexts}, nullptr},
    {"SIM Info", rows, {kFiles}, "<4>SimInfo", ignored},
};

// Process CO goes by the name of Process CS in the log, Coding Scheme by that of Cell Change Counters.
const std::vector<SectionPlan> kGSM = {
    {"Active Set", list, {{0x417A, 16}}, "<4>ActiveSet"},
    {"Coding Scheme", rows, {}, "<4>CellChangeCounters", ignored},
    {"GPRS Information", rows,
        {{0x51F5, 18}, {0x7135, 32}, {0x51F6, 24}, {0x51FB, 34}, {0x51FD, 35}, {0x51F4, 15}, {0x5137, 29}},
        "<4>GPRSInformation"},
    {"GSM Serving Cell", rows, {{0x5134, 26}, {0x5137, 29}, {0x5076, 17}, kCells}, "<4>GSMServingCell"},
    {"Mobile Allocation", rows, {{0x51F8, 15}}, "<4>MobileAllocation"},
    {"Neighboring Cells", list, {{0x5137, 29}, {0x51FF, 15}, kCells}, "<4>NeighboringCells"},
    {"PDP Context Info", list, {kContexts}, nullptr},
    {"Process PS", rows, {{0x7130, 16}, {0x7132, 16}}, "<4>ProcessPS"},
    {"UMTS RR Measurement", rows, {}, "<4>UMTSRRMeasurement", ignored},
    {"Cell Change Counters", rows, {}, "<4>CellChangeCounters", ignored},
    {"Detected Set", list, {{0x417A, 16}}, "<4>DetectedSet"},
    {"GSM Set", list, {{0x4005, 15}}, "<4>GSMSet"},
    {"Non-Ranked GSM Set", rows, {}, "<4>NonRankedGSMSet", ignored},
    {"Process CO", rows, {{0x7131, 16}, {0x7132, 16}}, "<4>ProcessCS"},
    {"Serving PLMN", rows, {{0x7135, 32}, {0x7132, 16}, kCells}, "<4>Serving PLMN"},
    {"UMTS Set", list, {{0x4005, 15}, kCells}, "<4>UMTSSet"},
    {"Equivalent PLMN List", list, {{0x7150, 17}}, "<4>Equivalent PLMN List"},
    {"GSM RR Info", rows, {{0x512C, 17}, {0x5137, 29}, {0x5072, 20}, {0x51F6, 24}}, "<4>GSMRRInfo"},
    {"Monitored Set", list, {{0x417A, 16}}, "<4>MonitoredSet"},
    {"Non-Ranked UMTS Set", rows, {}, "<4>NonRankedUMTSSet", ignored},
    {"Process CS", rows, {{0x7131, 16}, {0x7132, 16}}, "<4>ProcessCS"},
    {"UMTS RR Info", rows, {{0x4125, 14}, {0x4031, 16}, {0x4127, 29}, {0x4157, 19}, kCells}, "<4>UMTSRRInfo"},
    {"BLER", rows, {{0x4116, 16}}, "<4>BLER"},
    {"Virtual Active Set", list, {{0x417A, 16}}, "<4>VirtualActiveSet"},
    {"SIM Info", rows, {kFiles}, "<4>SimInfo", ignored},
    {"HSDPA Info", rows, {{0x4221, 18}}, "<4>HSDPA Info", ignored},
};

template <typename Index>
struct Technology {
    const char* templateName;
    const std::vector<SectionPlan>& plan;
    Index index = {};
};

// Calls the function with every technology.
template <typename Function>
void forEachTechnology(Function function)
{
    const QuietConsole quiet;
    function(Technology<LTEClassIndex>{"LTE", kLTE});
    function(Technology<UTRANClassIndex>{"MRL_UTRAN2", kUTRAN});
    function(Technology<MRL_GSMClassIndex>{"MRL_GSM", kGSM});
}

// The sections of a template by name, those inside of groups too.
void collectSections(
    const ClassIndex& index, const Dictionary& display, std::map<std::string, Value>& sections)
{
    for (const auto& [name, entry] : display) {
        if (index.getClass(name)) {
            EXPECT_TRUE(sections.emplace(name, entry).second) << name << " stands twice";
        } else {
            ASSERT_TRUE(entry.dictionary()) << name << " is neither section nor group";
            collectSections(index, *entry.dictionary(), sections);
        }
    }
}

std::map<std::string, Value> sectionsOfTemplate(const ClassIndex& index, const char* name)
{
    std::ifstream file(std::string(ORVEX_SOURCE_DIR "/resources/") + name + ".plist", std::ios::binary);
    const Bytes bytes((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    std::map<std::string, Value> sections;
    collectSections(index, *propertyListFromData(bytes).value.value().dictionary(), sections);
    return sections;
}

TEST(SectionPlan, ClassIndexAndTemplateNameTheSameSections)
{
    forEachTechnology([](const auto& technology) {
        const ClassIndex& index = technology.index;
        auto laidOut = sectionsOfTemplate(index, technology.templateName);
        EXPECT_EQ(laidOut.size(), technology.plan.size()) << technology.templateName;
        std::map<LogCode, std::vector<std::string>> wanted;
        for (const auto& [name, kind, packets, entryLine, otherCodes] : technology.plan) {
            ASSERT_NE(index.getClass(name), nullptr) << name;
            EXPECT_EQ(laidOut[name].array() != nullptr, kind == list) << name;
            std::vector<LogCode> codes;
            for (const auto& [code, minimumLength] : packets) {
                codes.push_back(code);
                wanted[code].emplace_back(name);
            }
            EXPECT_EQ(index.getClass(name)->getLogCodeArray(), codes) << name;
        }
        EXPECT_EQ(index.getAllLogCodes().size(), wanted.size());
        for (const auto& [code, names] : wanted) {
            std::vector<std::string> reached;
            ASSERT_NE(index.getSubscribers(code), nullptr) << code;
            for (const Base* section : *index.getSubscribers(code))
                reached.push_back(section->getSectionName());
            EXPECT_EQ(reached, names) << code;
        }
    });
}

// What a section says of one packet, and whether it changed anything.
std::pair<std::vector<std::string>, bool> reactionTo(Base& section, LogCode code, std::size_t length)
{
    const auto display = Dictionary::make({{"row", "kept"}});
    const auto records = Array::make({"kept"});
    std::vector<std::string> lines;
    for (const Value& container : {Value(display), Value(records)}) {
        section.updateSectionRef(container);
        RecordingLog log;
        section.updateWithData(Bytes(length, 0xFF), code);
        lines = log.take();
    }
    return {lines, *display != Dictionary({{"row", "kept"}}) || *records != Array({"kept"})};
}

TEST(SectionPlan, SectionsRefusePacketsThatAreNotForThem)
{
    using Lines = std::vector<std::string>;
    forEachTechnology([](const auto& technology) {
        for (const auto& [name, kind, packets, entryLine, otherCodes] : technology.plan) {
            if (!entryLine)
                continue; // takes any code
            Base& section = *technology.index.getClass(name);
            for (const auto& [code, minimumLength] : packets) {
                for (std::size_t length = 0; length < minimumLength; ++length)
                    EXPECT_EQ(reactionTo(section, code, length), std::pair(Lines{entryLine}, false))
                        << name << ' ' << code << ' ' << length;
                const bool isShown = minimumLength > 0 && code != 0x51FF; // which is only remembered
                EXPECT_TRUE(!isShown || reactionTo(section, code, minimumLength).second)
                    << name << ' ' << code;
            }
            Lines expected = {entryLine};
            if (otherCodes == OtherCodes::reported)
                expected.emplace_back("<3>Received an unknown log message: 4660");
            EXPECT_EQ(reactionTo(section, 0x1234, 400), std::pair(expected, false)) << name;
        }
    });
}

} // namespace
} // namespace orvex::test
