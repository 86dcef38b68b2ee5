// Writes binary property lists. PropertyListReaders.h describes the layout.

#include "PropertyListReaders.h"
#include "XMLText.h"

#include "Array.h"
#include "Dictionary.h"
#include "UTF8.h"

#include <algorithm>
#include <bit>
#include <unordered_map>

namespace orvex {

namespace {
void append(Bytes& bytes, std::uint64_t number, std::size_t width)
{
    for (std::size_t i = width; i-- > 0;)
        bytes.push_back(static_cast<std::uint8_t>(number >> (8 * i)));
}

std::size_t widthOf(std::uint64_t number)
{
    return number < 0x100 ? 1 : number < 0x10000 ? 2 : number < 0x1'0000'0000 ? 4 : 8;
}

void appendInteger(Bytes& bytes, std::uint64_t number)
{
    const std::size_t width = widthOf(number);
    bytes.push_back(static_cast<std::uint8_t>(0x10 | std::countr_zero(width)));
    append(bytes, number, width);
}

// The marker of an object with this many elements, characters or bytes.
void appendMarker(Bytes& bytes, unsigned kind, std::size_t size)
{
    bytes.push_back(static_cast<std::uint8_t>(kind << 4 | std::min<std::size_t>(size, 0xF)));
    if (size >= 0xF)
        appendInteger(bytes, size);
}

// Recursive: what Orvex writes is no deeper than what it reads.
class BinaryWriter {
public:
    // The number of the value's object. None if the value has no binary form.
    std::optional<std::size_t> add(const Value& value)
    {
        if (const std::string* text = value.string())
            return addText(*text);
        const std::size_t object = _objects.size();
        _objects.emplace_back();
        return fill(object, value) ? std::optional(object) : std::nullopt;
    }

    Bytes list() const
    {
        const std::size_t referenceWidth = widthOf(_objects.size());
        Bytes list{'b', 'p', 'l', 'i', 's', 't', '0', '0'};
        std::vector<std::size_t> offsets;
        for (const Object& object : _objects) {
            offsets.push_back(list.size());
            list.insert(list.end(), object.bytes.begin(), object.bytes.end());
            for (const std::size_t reference : object.references)
                append(list, reference, referenceWidth);
        }
        const std::size_t table = list.size();
        const std::size_t offsetWidth = widthOf(table);
        for (const std::size_t offset : offsets)
            append(list, offset, offsetWidth);
        append(list, 0, 6);
        list.push_back(static_cast<std::uint8_t>(offsetWidth));
        list.push_back(static_cast<std::uint8_t>(referenceWidth));
        append(list, _objects.size(), 8);
        append(list, 0, 8); // the root is object 0
        append(list, table, 8);
        return list;
    }

private:
    struct Object {
        Bytes bytes;                         // marker and content
        std::vector<std::size_t> references; // follow them
    };

    // Equal texts share one object.
    std::size_t addText(const std::string& text)
    {
        const auto [known, isNew] = _texts.try_emplace(text, _objects.size());
        if (isNew)
            appendText(_objects.emplace_back().bytes, text);
        return known->second;
    }

    static void appendText(Bytes& bytes, const std::string& text)
    {
        const auto isASCII = [](char character) { return static_cast<unsigned char>(character) < 0x80; };
        const std::string characters = xmlText(text);
        if (std::ranges::all_of(characters, isASCII)) {
            appendMarker(bytes, 0x5, characters.size());
            bytes.insert(bytes.end(), characters.begin(), characters.end());
            return;
        }
        const std::u16string units = utf16FromUTF8(characters);
        appendMarker(bytes, 0x6, units.size());
        for (const char16_t unit : units)
            append(bytes, unit, 2);
    }

    bool fill(std::size_t object, const Value& value)
    {
        Bytes& bytes = _objects[object].bytes;
        switch (value.kind()) {
        case Value::Kind::null:
        case Value::Kind::string: return false; // handled by addText()
        case Value::Kind::boolean: bytes = {static_cast<std::uint8_t>(*value.boolean() ? 0x09 : 0x08)}; break;
        case Value::Kind::integer: appendInteger(bytes, static_cast<std::uint64_t>(*value.integer())); break;
        case Value::Kind::real:
            bytes = {0x23};
            append(bytes, std::bit_cast<std::uint64_t>(*value.real()), 8);
            break;
        case Value::Kind::date:
            bytes = {0x33};
            append(
                bytes, std::bit_cast<std::uint64_t>(value.date()->secondsSince1970 - kPropertyListEpoch), 8);
            break;
        case Value::Kind::data:
            appendMarker(bytes, 0x4, value.data()->size());
            bytes.insert(bytes.end(), value.data()->begin(), value.data()->end());
            break;
        case Value::Kind::uid: {
            const std::size_t width = widthOf(value.uid()->number);
            bytes = {static_cast<std::uint8_t>(0x80 | (width - 1))};
            append(bytes, value.uid()->number, width);
            break;
        }
        case Value::Kind::array: return fillArray(object, 0xA, *value.heldArray());
        case Value::Kind::set: return fillArray(object, 0xC, *value.set()->elements);
        case Value::Kind::dictionary: return fillDictionary(object, *value.heldDictionary());
        }
        return true;
    }

    bool fillArray(std::size_t object, unsigned kind, const Array& array)
    {
        appendMarker(_objects[object].bytes, kind, array.size());
        return inside(&array, [&] {
            return std::ranges::all_of(array, [&](const Value& element) { return refer(object, element); });
        });
    }

    bool fillDictionary(std::size_t object, const Dictionary& dictionary)
    {
        appendMarker(_objects[object].bytes, 0xD, dictionary.size());
        std::vector<std::size_t> keys;
        const bool isGood = inside(&dictionary, [&] {
            return std::ranges::all_of(dictionary, [&](const Dictionary::Entry& entry) {
                keys.push_back(addText(entry.key));
                return refer(object, entry.value);
            });
        });
        auto& references = _objects[object].references;
        references.insert(references.begin(), keys.begin(), keys.end());
        return isGood;
    }

    bool refer(std::size_t container, const Value& element)
    {
        const auto object = add(element);
        if (object)
            _objects[container].references.push_back(*object);
        return object.has_value();
    }

    // False if the container holds itself.
    template <typename Step>
    bool inside(const void* container, Step step)
    {
        if (std::ranges::find(_open, container) != _open.end())
            return false;
        _open.push_back(container);
        const bool isGood = step();
        _open.pop_back();
        return isGood;
    }

    std::vector<Object> _objects;
    std::unordered_map<std::string, std::size_t> _texts;
    std::vector<const void*> _open;
};
} // namespace

std::optional<Bytes> propertyListBinary(const Value& value)
{
    BinaryWriter writer;
    return writer.add(value) ? std::optional(writer.list()) : std::nullopt;
}

} // namespace orvex
