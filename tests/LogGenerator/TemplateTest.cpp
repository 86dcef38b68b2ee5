#include "C2K/C2KFixture.h"
#include "GSM/MRL_GSMClassIndex.h"
#include "LTE/LTEClassIndex.h"
#include "UTRAN/UTRANClassIndex.h"

#include "Console.h"
#include "LogPackets.h"
#include "PropertyList.h"
#include "TextFormat.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <set>

namespace orvex::test {
namespace {

struct SectionPlan {
    const char* name;
    std::vector<LogCode> codes;
    bool isList;
};

// What each technology shows, in its sections' order of creation.
const std::vector<SectionPlan> kLTE = {
    {"Serving Cell Info", {0xB0C2, 0xB0C1, 0xFF0001}, false},
    {"Connected mode LTE Intra-frequency Measurement", {0xB179}, false},
    {"Measured Neighbor Cells", {0xB179}, true},
    {"Detected Cells", {0xB179}, true},
    {"Serving Cell Measurements", {0xB17F}, false},
    {"Neighbor Measurements", {0xB180}, false},
    {"Neighbor Cells List", {0xB180}, true},
    {"Reselection Candidates", {0xB186}, false},
    {"Reselection Candidates List", {0xB186}, true},
    {"SIM Info", {0xFF0000}, false},
    {"PDP Context Info", {0xFF0002}, true},
};

const std::vector<SectionPlan> kUTRAN = {
    {"RRC Info", {0xD0E0}, false},
    {"Serving Cell Info", {0xD0E2, 0xFF0001}, false},
    {"Neighbor Cell List", {0xD00A}, true},
    {"GSM Neighbor Cell List", {0xD00E}, true},
    {"TRCH BLER", {0xD00C}, true},
    {"CCTRCH SIR", {0xD00C}, true},
    {"PDP Context Info", {0xFF0002}, true},
    {"SIM Info", {0xFF0000}, false},
};

const std::vector<SectionPlan> kGSM = {
    {"Active Set", {0x417A}, true},
    {"Coding Scheme", {}, false},
    {"GPRS Information", {0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137}, false},
    {"GSM Serving Cell", {0x5134, 0x5137, 0x5076, 0xFF0001}, false},
    {"Mobile Allocation", {0x51F8}, false},
    {"Neighboring Cells", {0x5137, 0x51FF, 0xFF0001}, true},
    {"PDP Context Info", {0xFF0002}, true},
    {"Process PS", {0x7130, 0x7132}, false},
    {"UMTS RR Measurement", {}, false},
    {"Cell Change Counters", {}, false},
    {"Detected Set", {0x417A}, true},
    {"GSM Set", {0x4005}, true},
    {"Non-Ranked GSM Set", {}, false},
    {"Process CO", {0x7131, 0x7132}, false},
    {"Serving PLMN", {0x7135, 0x7132, 0xFF0001}, false},
    {"UMTS Set", {0x4005, 0xFF0001}, true},
    {"Equivalent PLMN List", {0x7150}, true},
    {"GSM RR Info", {0x512C, 0x5137, 0x5072, 0x51F6}, false},
    {"Monitored Set", {0x417A}, true},
    {"Non-Ranked UMTS Set", {}, false},
    {"Process CS", {0x7131, 0x7132}, false},
    {"UMTS RR Info", {0x4125, 0x4031, 0x4127, 0x4157, 0xFF0001}, false},
    {"BLER", {0x4116}, false},
    {"Virtual Active Set", {0x417A}, true},
    {"SIM Info", {0xFF0000}, false},
    {"HSDPA Info", {0x4221}, false},
};

DictionaryRef readTemplate(const char* name)
{
    std::ifstream file(std::string(ORVEX_SOURCE_DIR "/resources/") + name + ".plist", std::ios::binary);
    const Bytes bytes((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    const auto list = propertyListFromData(bytes);
    EXPECT_TRUE(list.value) << list.error;
    return list.value ? list.value->dictionary() : nullptr;
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

template <typename Index>
void expectPlan(const std::vector<SectionPlan>& plan, const char* templateName)
{
    const Index index;
    const auto display = readTemplate(templateName);
    ASSERT_NE(display, nullptr) << templateName;
    std::map<std::string, Value> laidOut;
    collectSections(index, *display, laidOut);
    EXPECT_EQ(laidOut.size(), plan.size()) << templateName;

    std::map<LogCode, std::vector<std::string>> wanted;
    for (const auto& [name, codes, isList] : plan) {
        const Base* section = index.getClass(name);
        ASSERT_NE(section, nullptr) << name;
        EXPECT_EQ(section->getLogCodeArray(), codes) << name;
        EXPECT_EQ(laidOut[name].kind(), isList ? Value::Kind::array : Value::Kind::dictionary) << name;
        for (const LogCode code : codes)
            wanted[code].emplace_back(name);
    }
    EXPECT_EQ(index.getAllLogCodes().size(), wanted.size());
    for (const auto& [code, names] : wanted) {
        std::vector<std::string> reached;
        ASSERT_NE(index.getSubscribers(code), nullptr) << code;
        for (const Base* section : *index.getSubscribers(code))
            reached.push_back(section->getSectionName());
        EXPECT_EQ(reached, names) << code;
    }
}

TEST(Template, ClassIndexAndTemplateNameTheSameSections)
{
    expectPlan<LTEClassIndex>(kLTE, "LTE");
    expectPlan<UTRANClassIndex>(kUTRAN, "MRL_UTRAN2");
    expectPlan<MRL_GSMClassIndex>(kGSM, "MRL_GSM");
}

// A packet of every code that holds a record of every list, with every key that a property list may have.
Bytes fullPacket(LogCode code)
{
    std::string numbers;
    for (const char* key : {"MCC", "MNC", "TAC", "LAC", "CellID", "PhysicalCellID", "BandInfo", "ARFCN",
             "UARFCN", "ScramblingCode"})
        numbers += text("<key>%s</key><integer>1</integer>", key);
    std::string files;
    for (const char* key : {"ICCID", "MSISDN", "MBDN", "HPPLMN", "LOCI", "PSLOCI", "ACC", "AD", "FPLMN",
             "AHPLMN", "RATMODE", "PNN", "OPL", "OPLMNAcT"})
        files += text("<key>kSimFile_%s</key><string>x</string>", key);
    const auto cell = [&numbers](const char* radio) {
        return text("<dict><key>RadioAccessTechnology</key><string>%s</string><key>CellType</key>"
                    "<string>Serving</string>%s</dict>",
            radio, numbers.c_str());
    };
    switch (code) {
    case kExtraCodeSimFiles: return propertyListPacket(code, "<dict>" + files + "</dict>");
    case kExtraCodeCellMonitorList:
        return propertyListPacket(
            code, "<array>" + cell("LTE") + cell("UTRAN") + cell("UMTS") + cell("GSM") + "</array>");
    case kExtraCodePDPContexts: return propertyListPacket(code, "<array/>");
    default: return packet(code, Bytes(40, 1));
    }
}

std::set<std::string> rowNames(const Dictionary& rows)
{
    std::set<std::string> names;
    for (const auto& entry : rows)
        names.insert(entry.key);
    return names;
}

// Every row that a template lays out is one that its section writes, and the other way round.
template <typename Index>
void expectRows(
    const char* templateName, const std::map<std::string, std::set<std::string>>& rowsThatComeAndGo)
{
    installConsole([](std::string_view) {});
    const Index index;
    std::map<std::string, Value> sections;
    collectSections(index, *readTemplate(templateName), sections);
    for (const auto& [name, entry] : sections) {
        Base* section = index.getClass(name);
        if (section->getLogCodeArray().empty())
            continue; // its rows are the template's alone
        const auto written = Dictionary::make();
        section->updateSectionRef(written);
        for (const LogCode code : section->getLogCodeArray())
            section->updateWithData(fullPacket(code), code);
        std::set<std::string> laidOut =
            entry.dictionary() ? rowNames(*entry.dictionary()) : std::set<std::string>();
        if (const auto extra = rowsThatComeAndGo.find(name); extra != rowsThatComeAndGo.end())
            laidOut.insert(extra->second.begin(), extra->second.end());
        EXPECT_EQ(rowNames(*written), laidOut) << name;
    }
    installConsole({});
}

TEST(Template, LaysOutTheRowsThatItsSectionsWrite)
{
    // The UARFCN of the cell-monitor list is taken away by the next serving cell packet.
    expectRows<LTEClassIndex>("LTE", {{"Serving Cell Info", {"UARFCN"}}});
    expectRows<UTRANClassIndex>("MRL_UTRAN2", {});
    expectRows<MRL_GSMClassIndex>("MRL_GSM", {{"UMTS RR Info", {"UARFCN"}}});
}

// The texts of a template of texts and dictionaries.
void collectTexts(const Dictionary& dictionary, std::set<std::string>& texts)
{
    for (const auto& entry : dictionary) {
        if (const auto section = entry.value.dictionary())
            collectTexts(*section, texts);
        else
            texts.insert(*entry.value.string());
    }
}

TEST(Template, OfCDMA2000NamesTheKeysThatItsDecodersPublish)
{
    std::set<std::string> named;
    collectTexts(*readTemplate("C2KTemplate"), named);
    EXPECT_EQ(named, (std::set<std::string>(kInternalKeys.begin(), kInternalKeys.end())));

    C2KFixture fixture;
    const Bytes frame(30, 1);
    for (const Bytes& bytes :
        {packet(0x1183, Bytes(37)), packet(0x12B6, Bytes(12)), packet(0x108A, Bytes(10)),
            packet(0x134F, Bytes(173, 2)), packet(0x1192, Bytes(228)), packet(0x127E, Bytes(1737)),
            packetOf(
                0x119C, {subpacket(1, frame), subpacket(2, frame), subpacket(3, frame), subpacket(4, {})}),
            packetOf(0x119D, {subpacket(11, frame)})})
        fixture.feed(bytes);
    EXPECT_EQ(rowNames(*fixture.display), named) << "each has its decoder";
}

} // namespace
} // namespace orvex::test
