#pragma once

#include "LogCodesDocument.h"
#include "ShownRows.h"

#include <gtest/gtest.h>

#include <map>
#include <optional>

namespace orvex::test {

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

} // namespace orvex::test
