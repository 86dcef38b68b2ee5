// What every section says and does with a packet that is too short, just long enough, or of another code.

#include "GSM/MRL_GSMClassIndex.h"
#include "LTE/LTEClassIndex.h"
#include "UTRAN/UTRANClassIndex.h"

#include "LogPackets.h"
#include "RecordingLog.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

enum class OtherCode { isReported, isIgnored };

struct Guard {
    const char* section;
    LogCode code;
    std::size_t minimumLength;
    const char* entryLine;
    OtherCode otherCode;
};

const std::vector<Guard> kLTE = {
    {"Serving Cell Info", 0xB0C1, 22, "<4>LTE Serving Cell Info", OtherCode::isReported},
    {"Serving Cell Info", 0xB0C2, 38, "<4>LTE Serving Cell Info", OtherCode::isReported},
    {"Connected mode LTE Intra-frequency Measurement", 0xB179, 29,
        "<4>Connected mode LTE Intra-frequency Measurement", OtherCode::isReported},
    {"Measured Neighbor Cells", 0xB179, 29, "<4>Measured Neighbor Cells", OtherCode::isReported},
    {"Detected Cells", 0xB179, 29, "<4>Detected Cells", OtherCode::isReported},
    {"Serving Cell Measurements", 0xB17F, 33, "<4>Serving Cell Measurements", OtherCode::isReported},
    {"Neighbor Measurements", 0xB180, 21, "<4>Neighbor Measurements", OtherCode::isReported},
    {"Neighbor Cells List", 0xB180, 21, "<4>Neighbor Cells List", OtherCode::isReported},
    {"Reselection Candidates", 0xB186, 21, "<4>Reselection Candidates", OtherCode::isReported},
    {"Reselection Candidates List", 0xB186, 21, "<4>Reselection Candidates List", OtherCode::isReported},
};

const std::vector<Guard> kUTRAN = {
    {"RRC Info", 0xD0E0, 0, "<4>RRC Info", OtherCode::isIgnored},
    {"Serving Cell Info", 0xD0E2, 26, "<4>Serving Cell Info", OtherCode::isIgnored},
    {"Neighbor Cell List", 0xD00A, 21, "<4>NeighbhorMeasurements List", OtherCode::isIgnored},
    {"GSM Neighbor Cell List", 0xD00E, 17, "<4>GSM Neighbor Cell List", OtherCode::isIgnored},
    {"TRCH BLER", 0xD00C, 17, "<5>TRCH BLER Measurement", OtherCode::isIgnored},
    {"CCTRCH SIR", 0xD00C, 17, "<4>CCTRCH SIR Measurement", OtherCode::isIgnored},
    {"SIM Info", kExtraCodeSimFiles, 0, "<4>SimInfo", OtherCode::isIgnored},
};

// Process CO goes by the name of Process CS in the log, Coding Scheme by that of Cell Change Counters.
const std::vector<Guard> kGSM = {
    {"GPRS Information", 0x51F5, 18, "<4>GPRSInformation", OtherCode::isReported},
    {"GPRS Information", 0x7135, 32, "<4>GPRSInformation", OtherCode::isReported},
    {"GPRS Information", 0x51F6, 24, "<4>GPRSInformation", OtherCode::isReported},
    {"GPRS Information", 0x51FB, 34, "<4>GPRSInformation", OtherCode::isReported},
    {"GPRS Information", 0x51FD, 35, "<4>GPRSInformation", OtherCode::isReported},
    {"GPRS Information", 0x51F4, 15, "<4>GPRSInformation", OtherCode::isReported},
    {"GPRS Information", 0x5137, 29, "<4>GPRSInformation", OtherCode::isReported},
    {"GSM Serving Cell", 0x5134, 26, "<4>GSMServingCell", OtherCode::isReported},
    {"GSM Serving Cell", 0x5137, 29, "<4>GSMServingCell", OtherCode::isReported},
    {"GSM Serving Cell", 0x5076, 17, "<4>GSMServingCell", OtherCode::isReported},
    {"Mobile Allocation", 0x51F8, 15, "<4>MobileAllocation", OtherCode::isReported},
    {"Neighboring Cells", 0x5137, 29, "<4>NeighboringCells", OtherCode::isReported},
    {"Neighboring Cells", 0x51FF, 15, "<4>NeighboringCells", OtherCode::isReported},
    {"GSM RR Info", 0x512C, 17, "<4>GSMRRInfo", OtherCode::isReported},
    {"GSM RR Info", 0x5137, 29, "<4>GSMRRInfo", OtherCode::isReported},
    {"GSM RR Info", 0x5072, 20, "<4>GSMRRInfo", OtherCode::isReported},
    {"GSM RR Info", 0x51F6, 24, "<4>GSMRRInfo", OtherCode::isReported},
    {"Active Set", 0x417A, 16, "<4>ActiveSet", OtherCode::isReported},
    {"Detected Set", 0x417A, 16, "<4>DetectedSet", OtherCode::isReported},
    {"Monitored Set", 0x417A, 16, "<4>MonitoredSet", OtherCode::isReported},
    {"Virtual Active Set", 0x417A, 16, "<4>VirtualActiveSet", OtherCode::isReported},
    {"UMTS Set", 0x4005, 15, "<4>UMTSSet", OtherCode::isReported},
    {"GSM Set", 0x4005, 15, "<4>GSMSet", OtherCode::isReported},
    {"Process CO", 0x7131, 16, "<4>ProcessCS", OtherCode::isReported},
    {"Process CO", 0x7132, 16, "<4>ProcessCS", OtherCode::isReported},
    {"Process CS", 0x7131, 16, "<4>ProcessCS", OtherCode::isReported},
    {"Process CS", 0x7132, 16, "<4>ProcessCS", OtherCode::isReported},
    {"Process PS", 0x7130, 16, "<4>ProcessPS", OtherCode::isReported},
    {"Process PS", 0x7132, 16, "<4>ProcessPS", OtherCode::isReported},
    {"Serving PLMN", 0x7135, 32, "<4>Serving PLMN", OtherCode::isReported},
    {"Serving PLMN", 0x7132, 16, "<4>Serving PLMN", OtherCode::isReported},
    {"Equivalent PLMN List", 0x7150, 17, "<4>Equivalent PLMN List", OtherCode::isReported},
    {"UMTS RR Info", 0x4125, 14, "<4>UMTSRRInfo", OtherCode::isReported},
    {"UMTS RR Info", 0x4031, 16, "<4>UMTSRRInfo", OtherCode::isReported},
    {"UMTS RR Info", 0x4127, 29, "<4>UMTSRRInfo", OtherCode::isReported},
    {"UMTS RR Info", 0x4157, 19, "<4>UMTSRRInfo", OtherCode::isReported},
    {"BLER", 0x4116, 16, "<4>BLER", OtherCode::isReported},
    {"HSDPA Info", 0x4221, 18, "<4>HSDPA Info", OtherCode::isIgnored},
    {"Coding Scheme", 0, 0, "<4>CellChangeCounters", OtherCode::isIgnored},
    {"Cell Change Counters", 0, 0, "<4>CellChangeCounters", OtherCode::isIgnored},
    {"UMTS RR Measurement", 0, 0, "<4>UMTSRRMeasurement", OtherCode::isIgnored},
    {"Non-Ranked GSM Set", 0, 0, "<4>NonRankedGSMSet", OtherCode::isIgnored},
    {"Non-Ranked UMTS Set", 0, 0, "<4>NonRankedUMTSSet", OtherCode::isIgnored},
};

using Lines = std::vector<std::string>;

// The log lines of one packet, which must leave dictionary and array alone.
Lines linesOfRefusal(Base& section, const Bytes& packet, LogCode code)
{
    Lines lines;
    for (const Value& container :
        {Value(Dictionary::make({{"row", "kept"}})), Value(Array::make({"kept"}))}) {
        const Value before = container.shallowCopy();
        section.updateSectionRef(container);
        RecordingLog log;
        section.updateWithData(packet, code);
        EXPECT_TRUE(container == before) << section.getSectionName();
        lines = log.take();
    }
    return lines;
}

// True when the section wrote rows or emptied its list.
bool takes(Base& section, const Bytes& packet, LogCode code)
{
    const auto rows = Dictionary::make();
    section.updateSectionRef(rows);
    section.updateWithData(packet, code);
    const auto list = Array::make({"stale"});
    section.updateSectionRef(list);
    section.updateWithData(packet, code);
    return *rows != Dictionary() || *list != Array({"stale"});
}

void expectGuards(const ClassIndex& index, const std::vector<Guard>& guards)
{
    for (const auto& [name, code, minimumLength, entryLine, otherCode] : guards) {
        Base* section = index.getClass(name);
        ASSERT_NE(section, nullptr) << name;
        for (std::size_t length = 0; length < minimumLength; ++length)
            EXPECT_EQ(linesOfRefusal(*section, Bytes(length, 0xFF), code), Lines{entryLine})
                << name << length;
        const bool isShown = minimumLength > 0 && code != 0x51FF; // which is only remembered
        EXPECT_TRUE(!isShown || takes(*section, Bytes(minimumLength, 0xFF), code)) << name << " " << code;

        const LogCode foreign = 0x1234;
        Lines expected = {entryLine};
        if (otherCode == OtherCode::isReported)
            expected.emplace_back("<3>Received an unknown log message: 4660");
        EXPECT_EQ(linesOfRefusal(*section, Bytes(400, 0xFF), foreign), expected) << name;
    }
}

TEST(Section, RefusesPacketsThatAreNotForIt)
{
    expectGuards(LTEClassIndex(), kLTE);
    expectGuards(UTRANClassIndex(), kUTRAN);
    expectGuards(MRL_GSMClassIndex(), kGSM);
}

} // namespace
} // namespace orvex::test
