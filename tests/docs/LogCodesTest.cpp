// Writes values into packets as docs/log-codes.md lays them out and compares what is shown.

#include "LogCodesDocument.h"
#include "RowCheck.h"
#include "ShownRows.h"

#include "GSM/MRL_GSMLogGenerator.h"
#include "LTE/LTELogGenerator.h"
#include "PropertyList.h"
#include "UTRAN/UTRANLogGenerator.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <memory>
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

std::unique_ptr<ClassIndex> classIndexOf(const std::string& technology)
{
    if (technology == "MRL_GSM")
        return std::make_unique<MRL_GSMClassIndex>();
    if (technology == "MRL_LTE")
        return std::make_unique<LTEClassIndex>();
    return technology == "MRL_UTRAN2" ? std::make_unique<UTRANClassIndex>() : nullptr;
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

TEST_P(LogCodes, HaveTheMinimumLengthOfTheDocument)
{
    for (const DocumentedCode& code : codes) {
        if (code.minimumLength == 0)
            continue;
        bool isTaken = std::ranges::none_of(code.fields, &DocumentedField::isRow); // not to be seen then
        for (const Bytes& packet : technology.packetsOf(code.code)) {
            const Rows before = technology.shownBy({packet});
            // Whether a packet of that length, with other bytes, changes what the whole packet has shown.
            const auto isTakenAt = [&](std::size_t length) {
                return std::ranges::any_of(std::array{0x00, 0x01, 0xFF}, [&](int change) {
                    Bytes cut = packet;
                    cut.resize(length);
                    for (std::size_t i = kPacketHeaderLength; i < length; ++i)
                        cut[i] = static_cast<std::uint8_t>(change == 0 ? 0 : cut[i] ^ change);
                    return technology.shownBy({packet, cut}) != before;
                });
            };
            EXPECT_FALSE(isTakenAt(code.minimumLength - 1)) << nameOf(code.code) << " is read when shorter";
            isTaken = isTaken || isTakenAt(code.minimumLength);
        }
        EXPECT_TRUE(isTaken) << nameOf(code.code) << " is not read";
    }
}

TEST_P(LogCodes, AreThoseOfTheDocumentAndSoAreTheirSections)
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

    const auto index = classIndexOf(GetParam());
    for (const DocumentedCode& code : index ? codes : std::vector<DocumentedCode>()) {
        const auto* const subscribers = index->getSubscribers(code.code);
        ASSERT_TRUE(subscribers) << nameOf(code.code);
        std::vector<std::string> sections;
        for (const Base* section : *subscribers)
            sections.push_back(section->getSectionName());
        EXPECT_EQ(code.sections, sections) << nameOf(code.code);
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
