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

DictionaryRef readTemplate(const char* name)
{
    std::ifstream file(std::string(ORVEX_SOURCE_DIR "/resources/") + name + ".plist", std::ios::binary);
    const Bytes bytes((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    const auto list = propertyListFromData(bytes);
    EXPECT_TRUE(list.value) << list.error;
    return list.value ? list.value->dictionary() : nullptr;
}

template <typename Index>
void expectPlan(const std::vector<SectionPlan>& plan, const char* templateName)
{
    const Index index;
    const auto display = readTemplate(templateName);
    ASSERT_NE(display, nullptr) << templateName;
    EXPECT_EQ(display->size(), plan.size()) << "nothing but sections in " << templateName;

    std::map<LogCode, std::vector<std::string>> wanted;
    for (const auto& [name, codes, isList] : plan) {
        const Base* section = index.getClass(name);
        ASSERT_NE(section, nullptr) << name;
        EXPECT_EQ(section->getLogCodeArray(), codes) << name;
        const Value& entry = (*display)[name];
        EXPECT_EQ(entry.kind(), isList ? Value::Kind::array : Value::Kind::dictionary) << name;
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
}

// The smallest packet of every code, with every key that a property list may have.
Bytes fullPacket(LogCode code)
{
    std::string numbers;
    for (const char* key : {"TAC", "LAC", "CellID", "PhysicalCellID", "BandInfo", "UARFCN", "ScramblingCode"})
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
        return propertyListPacket(code, "<array>" + cell("LTE") + cell("UTRAN") + "</array>");
    case kExtraCodePDPContexts: return propertyListPacket(code, "<array/>");
    default: return packet(code, Bytes(40));
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
    const auto display = readTemplate(templateName);
    for (const auto& [name, entry] : *display) {
        Base* section = index.getClass(name);
        ASSERT_NE(section, nullptr) << name;
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
}

} // namespace
} // namespace orvex::test
