// Writes values into packets as docs/log-codes.md lays them out and compares what is shown.

#include "CaseFile.h"
#include "LogCodesDocument.h"
#include "RowCheck.h"
#include "ShownRows.h"

#include "PropertyList.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <regex>
#include <set>

namespace orvex::test {

namespace {

// The path with every index the same.
std::string withoutIndexes(const std::string& path)
{
    static const std::regex index("/ ([ij]|[0-9]+)(?= |$)");
    return std::regex_replace(path, index, "/ #");
}

std::string nameOf(LogCode code)
{
    return text("0x%04X", static_cast<unsigned>(code));
}

class LogCodes : public testing::TestWithParam<const char*> {
public:
    LogCodes()
    {
        for (const DocumentedCode& code : documentedCodes()) {
            if (code.technology == GetParam())
                codes.push_back(code);
        }
    }

    const Technology technology{GetParam()};
    std::vector<DocumentedCode> codes;
};

} // namespace

TEST_P(LogCodes, StandWhereTheDocumentSays)
{
    for (const DocumentedCode& code : codes) {
        const Packets packets = technology.packetsOf(code.code);
        for (std::size_t field = 0; field < code.fields.size(); ++field) {
            for (int record = 0; code.fields[field].isRow() && record < code.fields[field].records();
                 ++record) {
                SCOPED_TRACE(nameOf(code.code) + ": " + code.fields[field].pathOf(record));
                RowCheck(technology, code, field, record).run(packets);
            }
        }
    }
}

TEST_P(LogCodes, ChangeNoRowThatTheDocumentLacks)
{
    const Rows untouched = technology.shownBy({Bytes(kPacketHeaderLength)}); // of no code
    for (const DocumentedCode& code : codes) {
        std::set<std::string> documented;
        for (const DocumentedField& field : code.fields)
            documented.insert(withoutIndexes(field.path));
        for (const Bytes& packet : technology.packetsOf(code.code)) {
            for (const auto& [path, shown] : technology.shownBy({packet})) {
                const auto before = untouched.find(path);
                const bool isEmptyList = shown == "(none)";
                if (before == untouched.end() || before->second != shown) {
                    EXPECT_TRUE(documented.contains(withoutIndexes(path) + (isEmptyList ? " / #" : "")))
                        << nameOf(code.code) << ": " << path;
                }
            }
        }
    }
}

TEST_P(LogCodes, AreThoseTheGeneratorWants)
{
    std::set<std::int64_t> documented;
    std::set<std::int64_t> wanted;
    for (const DocumentedCode& code : codes)
        documented.insert(code.code);
    const ArrayRef subscribed =
        (*technology.generator()->getStartCommand())[telephony::kSetMarlinLogCodes].array();
    for (const Value& code : *subscribed)
        wanted.insert(*code.integer());
    EXPECT_EQ(documented, wanted);
}

// The cases, which the tests of the generators hold against the code.
TEST_P(LogCodes, HaveTheSectionsAndMinimumLengthsOfTheCases)
{
    static const std::regex tooShort("Log code 0x([0-9a-f]+) is .* (?:at least|should be) ([0-9]+) bytes");
    std::map<LogCode, std::vector<std::string>> sections;
    std::map<LogCode, std::size_t> lengths; // the least of the sections
    for (const std::string& line : caseLines(text("LogGenerator/cases/%s.txt", GetParam()))) {
        if (std::smatch match; std::regex_search(line, match, tooShort))
            lengths[std::stoi(match[1], nullptr, 16)] = std::stoul(match[2]);
        if (line[0] != '[')
            continue;
        const SectionPlan plan(line);
        for (std::size_t i = 0; i < plan.codes.size(); ++i) {
            sections[plan.codes[i]].push_back(plan.name);
            const auto [length, isFirst] = lengths.emplace(plan.codes[i], plan.minimumLengths[i]);
            length->second = std::min(length->second, plan.minimumLengths[i]);
        }
    }
    for (const DocumentedCode& code : codes) {
        EXPECT_TRUE(code.minimumLength == 0 || code.minimumLength == lengths[code.code]) << nameOf(code.code);
        EXPECT_TRUE(sections.empty() || code.sections == sections[code.code]) << nameOf(code.code);
    }
}

namespace {

Bytes extraPacket(LogCode code, const Value& list)
{
    Bytes packet(kPacketHeaderLength);
    packet[0] = MessageFrame::kTypeExtra;
    packet[3] = static_cast<std::uint8_t>(code);
    const Bytes binary = propertyListBinary(list).value();
    packet.insert(packet.end(), binary.begin(), binary.end());
    return packet;
}

} // namespace

TEST(ExtraPackets, AreShownAsTheDocumentSays)
{
    std::size_t checked = 0;
    for (const DocumentedCode& code : documentedCodes()) {
        for (const Cells& cells : code.otherRows) {
            if (code.code == kExtraCodeSimFiles) {
                const Value files = Dictionary::make({{cells[0], "what the file holds"}});
                for (const char* technology : {"MRL_LTE", "MRL_UTRAN2", "MRL_GSM"})
                    EXPECT_EQ(Technology(technology)
                                  .shownBy({extraPacket(code.code, files)})["SIM Info / " + cells[1]],
                        "what the file holds")
                        << technology;
                ++checked;
            } else if (code.code == kExtraCodeCellMonitorList) {
                const std::size_t blank = cells[1].find(' ');
                const bool isCut = cells[4] == "low 16 bits";
                const Value list = Array::make({Dictionary::make({
                    {telephony::kCellRadioAccessTechnology, cells[1].substr(0, blank)},
                    {telephony::kCellType, cells[1].substr(blank + 1)},
                    {cells[2], isCut ? 0x1002D : 45},
                })});
                const std::string shown =
                    Technology(cells[0]).shownBy({extraPacket(code.code, list)})[cells[3]];
                EXPECT_EQ(shown, isCut ? "45" : textFor(cells[4], 45, shown)) << cells[0] << ": " << cells[3];
                ++checked;
            }
        }
    }
    EXPECT_EQ(checked, 14 + 28);
}

INSTANTIATE_TEST_SUITE_P(
    Technology, LogCodes, testing::Values("MRL_LTE", "MRL_UTRAN2", "MRL_GSM", "MRL_CDMA"));

} // namespace orvex::test
