// Writes values into packets as docs/log-codes.md lays them out and compares what is shown.

#include "LogCodesDocument.h"

#include "Captures.h"
#include "FixedClock.h"
#include "FixedResources.h"

#include "FileStorage.h"
#include "GSM/MRL_GSMLogGenerator.h"
#include "LTE/LTELogGenerator.h"
#include "MessageFrame.h"
#include "PropertyList.h"
#include "SystemLog.h"
#include "UTRAN/UTRANLogGenerator.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <random>
#include <regex>
#include <set>

namespace orvex::test {

namespace {

using Rows = std::map<std::string, std::string>; // texts by path
using Packets = std::vector<Bytes>;

void collect(const Value& value, const std::string& path, Rows& rows)
{
    if (const std::string* text = value.string())
        rows[path] = *text;
    if (const DictionaryRef dictionary = value.dictionary()) {
        for (const auto& [key, child] : *dictionary) {
            if (key == "_sorted")
                continue;
            const std::size_t semicolon = key.find(';'); // INDEX;PN, a pilot
            const std::string below = (path.empty() ? "" : path + " / ") + key.substr(0, semicolon);
            if (semicolon != std::string::npos)
                rows[below + " / PN"] = key.substr(semicolon + 1);
            collect(child, below, rows);
        }
    }
    if (const ArrayRef array = value.array()) {
        for (std::size_t i = 0; i < array->size(); ++i)
            collect((*array)[i], path + " / " + std::to_string(i), rows);
    }
}

// A technology's generator with its template, and the packets of its capture.
class Technology {
public:
    explicit Technology(std::string name)
        : _name(std::move(name))
    {
        installConsole([](std::string_view) {}); // some sections write a line for every packet
        const FileResources files(ORVEX_RESOURCES);
        for (const char* resource : {"C2KTemplate", "LTE", "MRL_GSM", "MRL_UTRAN2"})
            _resources.templates[resource] = files.dictionaryNamed(resource).dictionary;
    }
    ~Technology() { installConsole({}); }
    Technology(const Technology&) = delete;
    Technology& operator=(const Technology&) = delete;

    std::unique_ptr<LogGenerator> generator() const
    {
        return LogGenerator::generatorFromTechnology(_name, {_resources, _clock, {}, 0});
    }
    Rows shownBy(const Packets& packets) const
    {
        Dictionary state;
        const auto decoder = generator();
        for (const Bytes& packet : packets)
            decoder->updateState(state, packet);
        Rows rows;
        collect(state["Display"], "", rows);
        return rows;
    }

    // Packets of the code to write into: from the capture, and some of them with other bytes here and there.
    Packets packetsOf(LogCode code) const
    {
        constexpr std::size_t kOfCapture = 6;
        Packets found;
        for (const Bytes& message : captureOf(_name)) {
            const MessageFrame frame(message);
            if (frame.logCode() == code)
                found.emplace_back(frame.packet().begin(), frame.packet().end());
        }
        std::ranges::stable_sort(found, std::greater(), &Bytes::size);
        const std::size_t taken = std::min(kOfCapture, found.size());
        Packets packets;
        for (std::size_t i = 0; i < taken; ++i) {
            Bytes packet = found[i * found.size() / taken];
            packets.push_back(packet);
            if (i % 3 != 0)
                continue;
            for (std::size_t byte = kPacketHeaderLength; byte < packet.size(); ++byte) {
                if (random() % 4 == 0)
                    packet[byte] = static_cast<std::uint8_t>(random());
            }
            packets.push_back(packet);
        }
        return packets;
    }

    std::uint64_t random() const { return _random(); }

private:
    std::string _name;
    FixedResources _resources;
    FixedClock _clock;
    mutable std::mt19937_64 _random{1}; // the same packets every time
};

// A row of the document, in one record of the packets of its code.
class RowCheck {
public:
    RowCheck(const Technology& technology, const DocumentedCode& code, std::size_t field, int record)
        : _technology(technology)
        , _code(code)
        , _field(code.fields[field])
        , _number(field)
        , _record(record)
        , _path(_field.pathOf(record))
    {
    }

    // Fails unless some packet shows the row.
    void run(const Packets& packets)
    {
        for (Bytes packet : packets) {
            const auto place = meetConditions(packet);
            if (!place || place->firstBit + place->width > 8 * packet.size())
                continue;
            if (_field.isOpaque())
                compareNeighbors(packet, *place);
            else
                writeValues(packet, *place);
        }
        EXPECT_TRUE(_isShown) << "no packet shows it";
        if (_isInWords) {
            EXPECT_TRUE(_lowMatters) << "its first bits do not matter";
            EXPECT_TRUE(_highMatters) << "its last bit does not matter";
        }
    }

private:
    // Sets the fields on which the row depends. Returns where the row's own field then stands.
    std::optional<DocumentedField::Place> meetConditions(Bytes& packet) const
    {
        std::map<std::string, const DocumentedField*> conditions; // the last one at each offset
        for (std::size_t i = 0; i < _number; ++i) {
            if (_code.fields[i].isCondition())
                conditions[_code.fields[i].offset] = &_code.fields[i];
        }
        for (const auto& [offset, condition] : conditions) {
            for (int record = 0; record <= _record; ++record) {
                const auto place = _code.place(*condition, packet, record);
                if (place && place->firstBit + place->width <= 8 * packet.size())
                    setValue(packet, *condition, *place, std::stoul(condition->path.substr(2)));
            }
        }
        return _code.place(_field, packet, _record);
    }

    // None when the row is missing, or as the template left it.
    std::optional<std::string> textOf(const Bytes& packet) const
    {
        Packets packets = {packet};
        const auto sequence = std::ranges::find(_code.fields, "*sequence*", &DocumentedField::path);
        if (sequence != _code.fields.end()) { // a rate, which is shown from the second packet on
            Bytes previous(packet.size());
            std::copy_n(packet.begin(), kPacketHeaderLength, previous.begin());
            const auto place = _code.place(*sequence, packet, 0).value();
            setValue(previous, *sequence, place, valueAt(packet, *sequence, place) - 1);
            packets.insert(packets.begin(), previous);
        }
        const Rows rows = _technology.shownBy(packets);
        const auto row = rows.find(_path);
        const bool isSet = row != rows.end() && !row->second.empty() && row->second != "—";
        return isSet ? std::optional(row->second) : std::nullopt;
    }

    void writeValues(Bytes packet, DocumentedField::Place place)
    {
        const std::uint64_t highest = (std::uint64_t{1} << place.width) - 1;
        std::vector<std::uint64_t> values = {0, 1, highest, highest >> 1, (highest >> 1) + 1};
        for (int i = 0; i < 3; ++i)
            values.push_back(_technology.random() >> _technology.random() % 64);
        for (const std::uint64_t value : _field.valuesWithText())
            values.push_back(value);
        for (const std::uint64_t value : values) {
            setValue(packet, _field, place, value & highest);
            const auto text = textOf(packet);
            if (!text)
                continue;
            _isShown = true;
            const auto expected = _field.expected(value & highest, *text);
            if (!expected) {
                compareNeighbors(packet, place);
            } else if (*text != *expected) {
                ADD_FAILURE() << "shows " << *text << ", not " << *expected << ", for " << (value & highest);
                return;
            }
        }
        expectNothingBeside(packet, place);
    }

    // Words are not understood; but the text must depend on the field's first and last bits and on no bit
    // beside them.
    void compareNeighbors(const Bytes& packet, DocumentedField::Place place)
    {
        if (!textOf(packet))
            return;
        _isShown = _isInWords = true;
        _lowMatters = _lowMatters || changes(packet, place.firstBit, place.width > 8 ? 8 : 1);
        _highMatters = _highMatters || changes(packet, place.firstBit + place.width - 1, 1);
        expectNothingBeside(packet, place);
    }

    // The bits before and after the field are not part of it.
    void expectNothingBeside(const Bytes& packet, DocumentedField::Place place) const
    {
        for (const std::size_t bit : {place.firstBit - 1, place.firstBit + place.width}) {
            if (bit < 8 * packet.size() && !isNamed(packet, bit)) {
                EXPECT_FALSE(changes(packet, bit, 1))
                    << "bit " << bit % 8 << " of byte " << bit / 8 << " matters too";
            }
        }
    }

    // Whether the row has another text when bits change. A row that disappears does not count.
    bool changes(const Bytes& packet, std::size_t firstBit, std::size_t width) const
    {
        Bytes changed = packet;
        for (std::size_t bit = firstBit; bit < firstBit + width; ++bit)
            changed[bit / 8] = static_cast<std::uint8_t>(changed[bit / 8] ^ (1U << (bit % 8)));
        const auto text = textOf(packet);
        const auto changedText = textOf(changed);
        return text && changedText && *changedText != *text;
    }

    // True for bits of a field that shows nothing itself but on which rows may depend.
    bool isNamed(const Bytes& packet, std::size_t bit) const
    {
        return std::ranges::any_of(_code.fields, [&](const DocumentedField& field) {
            const auto place = field.isRow() ? std::nullopt : _code.place(field, packet, _record);
            return place && bit >= place->firstBit && bit < place->firstBit + place->width;
        });
    }

    const Technology& _technology;
    const DocumentedCode& _code;
    const DocumentedField& _field;
    std::size_t _number;
    int _record;
    std::string _path;
    bool _isShown = false;
    bool _isInWords = false;
    bool _lowMatters = false;
    bool _highMatters = false;
};

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
