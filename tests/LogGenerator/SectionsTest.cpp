// The sections of each technology, against cases/TECHNOLOGY.txt: which packets a section takes, and what it
// makes of packets written by hand.

#include "CaseFile.h"
#include "GSM/MRL_GSMLogGenerator.h"
#include "GeneratorFixture.h"
#include "LTE/LTELogGenerator.h"
#include "UTRAN/UTRANLogGenerator.h"

#include "FileStorage.h"
#include "MessageFrame.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"

#include <cxxabi.h>

#include <set>

namespace orvex::test {
namespace {

std::unique_ptr<ClassIndex> newClassIndex(std::string_view technology)
{
    if (technology == telephony::kTechnologyMRL_GSM)
        return std::make_unique<MRL_GSMClassIndex>();
    if (technology == telephony::kTechnologyMRL_LTE)
        return std::make_unique<LTEClassIndex>();
    return std::make_unique<UTRANClassIndex>();
}

// Feeds the packets into a container and returns what was logged, the lines on the console too.
Lines feed(Base& section, const Value& container, const std::vector<Bytes>& packets)
{
    section.updateSectionRef(container);
    RecordingLog log;
    const ConsoleLines console(&log.lines);
    for (const Bytes& packet : packets)
        section.updateWithData(packet, MessageFrame(packet).logCode());
    return log.take();
}

struct Outcome {
    std::string shown;
    Lines log;
    std::size_t records = 0; // of a list
};

// The rows that a section writes, or its list when it writes no rows.
Outcome outcomeOf(Base& section, const std::vector<Bytes>& packets)
try {
    const auto list = Array::make({"stale"});
    feed(section, list, packets);
    const auto rows = Dictionary::make();
    const Lines log = feed(section, rows, packets);
    if (!rows->isEmpty())
        return {shown(*rows), log};
    const bool isLeftAlone = *list == Array({"stale"});
    return {isLeftAlone ? "(nothing)" : list->isEmpty() ? "(empty)" : shown(*list), log, list->size()};
} catch (...) {
    const std::unique_ptr<char, void (*)(void*)> type(
        abi::__cxa_demangle(abi::__cxa_current_exception_type()->name(), nullptr, nullptr, nullptr),
        std::free);
    return {std::string("throws ") + type.get(), {}};
}

class SectionsTest : public testing::TestWithParam<const char*> {
protected:
    const std::vector<std::string> lines = caseLines(text("LogGenerator/cases/%s.txt", GetParam()));
};

INSTANTIATE_TEST_SUITE_P(, SectionsTest,
    testing::Values(
        telephony::kTechnologyMRL_GSM, telephony::kTechnologyMRL_LTE, telephony::kTechnologyMRL_UTRAN2),
    [](const auto& each) { return std::string(each.param); });

// What a section logs for one packet, and whether it changed anything.
std::pair<Lines, bool> reactionTo(Base& section, LogCode code, std::size_t length)
{
    const auto display = Dictionary::make();
    const auto records = Array::make({"kept"});
    const Bytes bytes = packet(code, Bytes(length - kPacketHeaderLength, 0xFF));
    feed(section, records, {bytes});
    const Lines log = feed(section, display, {bytes});
    return {log, !display->isEmpty() || *records != Array({"kept"})};
}

// The sections that a template lays out, those inside of groups too.
void collectSections(const ClassIndex& index, const Dictionary& display, std::set<std::string>& names)
{
    for (const auto& [name, entry] : display) {
        if (index.getClass(name))
            EXPECT_TRUE(names.insert(name).second) << name;
        else
            collectSections(index, *entry.dictionary(), names); // a group
    }
}

TEST_P(SectionsTest, TakeTheirPackets)
{
    const auto index = newClassIndex(GetParam());
    std::map<LogCode, CodeDictionary::Subscribers> wanted;
    std::set<std::string> planned;
    for (const std::string& line : lines) {
        if (line[0] != '[')
            continue;
        SCOPED_TRACE(line);
        const SectionPlan plan(line);
        ASSERT_NE(index->getClass(plan.name), nullptr);
        Base& section = *index->getClass(plan.name);
        planned.insert(plan.name);
        EXPECT_EQ(section.getLogCodeArray(), plan.codes);
        Lines expected = plan.entryLine.empty() ? Lines() : Lines{plan.entryLine};
        for (std::size_t i = 0; i < plan.codes.size(); ++i) {
            wanted[plan.codes[i]].push_back(&section);
            const std::size_t length = plan.minimumLengths[i];
            if (length == 0 || plan.codes[i] == 0x51FF) // which is only remembered
                continue;
            EXPECT_EQ(reactionTo(section, plan.codes[i], length - 1), std::pair(expected, false));
            EXPECT_TRUE(reactionTo(section, plan.codes[i], length).second) << length;
        }
        if (plan.entryLine.empty())
            continue; // takes any code
        if (!plan.otherCodes.empty())
            expected.emplace_back("<3>Received an unknown log message: 4660");
        EXPECT_EQ(reactionTo(section, 0x1234, 400), std::pair(expected, false));
    }
    EXPECT_EQ(index->getAllLogCodes().size(), wanted.size());
    for (const auto& [code, sections] : wanted)
        EXPECT_EQ(*index->getSubscribers(code), sections) << code;
    const bool isLTE = GetParam() == std::string_view(telephony::kTechnologyMRL_LTE);
    std::set<std::string> laidOut;
    const FileResources resources(ORVEX_RESOURCES);
    collectSections(*index, *resources.dictionaryNamed(isLTE ? "LTE" : GetParam()).dictionary, laidOut);
    EXPECT_EQ(laidOut, planned);
}

// The packets with their property lists, where they have one, in binary form.
std::vector<Bytes> inBinaryForms(std::vector<Bytes> packets)
{
    for (Bytes& packet : packets) {
        const auto list = propertyListFromData(PacketReader(packet).from(kPacketHeaderLength).bytes());
        if (MessageFrame(packet).logCode() < kExtraCodeBase || !list.value)
            continue;
        const Bytes binary = propertyListBinary(*list.value).value();
        packet.resize(kPacketHeaderLength);
        packet.insert(packet.end(), binary.begin(), binary.end());
    }
    return packets;
}

void expectOutcome(Base& section, const PacketCase& each)
{
    const auto [shown, log, records] = outcomeOf(section, each.packets);
    EXPECT_EQ(each.shown[0] == '#' ? "#" + std::to_string(records) : shown, each.shown);
    std::string errors;
    for (const std::string& line : log)
        errors += line.starts_with("<3>") ? line.substr(3) : "";
    EXPECT_EQ(each.log[0] == '<' ? joined(log) : errors, each.log);
    EXPECT_EQ(outcomeOf(section, inBinaryForms(each.packets)).shown, shown);
}

void expectTexts(Base& section, const TextsCase& each)
{
    for (int value = 0; value < 256; ++value) {
        const auto rows = Dictionary::make();
        feed(section, rows, {each.packetWith(value)});
        EXPECT_EQ((*rows)[each.row], Value(each.textFor(value))) << value;
    }
}

TEST_P(SectionsTest, ShowTheirCases)
{
    std::string name;
    for (const std::string& line : lines) {
        SCOPED_TRACE(name + ": " + line.substr(0, 200));
        const auto index = newClassIndex(GetParam()); // a new one, as sections remember things
        if (line[0] == '[')
            name = SectionPlan(line).name;
        else if (line.find(" => ") != std::string::npos)
            expectTexts(*index->getClass(name), TextsCase(line));
        else
            expectOutcome(*index->getClass(name), PacketCase(line));
    }
}

} // namespace
} // namespace orvex::test
