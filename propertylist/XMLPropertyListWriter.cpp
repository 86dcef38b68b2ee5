// Writes XML property lists.

#include "PropertyList.h"

#include "XMLScalars.h"
#include "XMLText.h"

#include "Array.h"
#include "Dictionary.h"
#include "VisibleText.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <utility>
#include <vector>

namespace orvex {

namespace {
constexpr std::size_t kPiece = std::size_t{64} << 10; // the sink gets at least this much at a time

// The dictionary itself, unless some of its keys become equal in XML: then the first takes the last one's
// value.
DictionaryRef withKeysOfXML(const DictionaryRef& dictionary)
{
    const auto isSame = [](const Dictionary::Entry& entry) { return xmlText(entry.key) == entry.key; };
    if (std::all_of(dictionary->begin(), dictionary->end(), isSame))
        return dictionary;
    auto result = Dictionary::make();
    for (const auto& [key, value] : *dictionary)
        result->set(xmlText(key), value);
    return result;
}

std::string dateOf(Date date)
{
    const std::string text = dateText(date); // 2024-03-05 14:07:09 +0000
    const std::size_t time = text.find(' ') + 1;
    return text.substr(0, time - 1) + 'T' + text.substr(time, text.find(' ', time) - time) + 'Z';
}

// Not recursive: a value may be nested to any depth.
class XMLWriter {
public:
    explicit XMLWriter(const TextSink& sink)
        : _sink(sink)
    {
    }

    std::string run(const Value& root)
    {
        put("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<plist version=\"1.0\">\n");
        write(root);
        while (!_open.empty() && _fault.empty())
            writeNext();
        if (_fault.empty())
            put("</plist>\n");
        flush();
        return _fault;
    }

private:
    // A container whose elements are being written.
    struct Open {
        const void* identity; // of the container in the value
        const Array* array;   // null for a dictionary
        DictionaryRef entries;
        std::size_t written = 0; // elements, including the current one

        std::size_t size() const { return entries ? entries->size() : array->size(); }
        const Dictionary::Entry& entry(std::size_t i) const
        {
            return entries->begin()[static_cast<std::ptrdiff_t>(i)];
        }
    };

    void writeNext()
    {
        Open& container = _open.back();
        if (container.written == container.size()) {
            const char* end = container.entries ? "</dict>\n" : "</array>\n";
            _open.pop_back();
            indent();
            put(end);
            return;
        }
        const std::size_t i = container.written++;
        if (!container.entries)
            return write((*container.array)[i]);
        const Dictionary::Entry& entry = container.entry(i);
        putElement("key", entry.key);
        write(entry.value);
    }

    void write(const Value& value)
    {
        switch (value.kind()) {
        case Value::Kind::null: return fail("is null");
        case Value::Kind::string: return putElement("string", *value.string());
        case Value::Kind::integer: return putElement("integer", std::to_string(*value.integer()));
        case Value::Kind::real: return putReal(*value.real());
        case Value::Kind::boolean: return putLine(*value.boolean() ? "<true/>\n" : "<false/>\n");
        case Value::Kind::date: return putDate(*value.date());
        case Value::Kind::data: return putData(value.dataPieces());
        case Value::Kind::array: return open(value.heldArray(), value.heldArray(), nullptr);
        case Value::Kind::dictionary:
            return open(value.heldDictionary(), nullptr, withKeysOfXML(value.dictionary()));
        case Value::Kind::uid: return putUID(*value.uid());
        case Value::Kind::set: return open(value.set()->elements.get(), value.set()->elements.get(), nullptr);
        }
    }

    void open(const void* identity, const Array* array, DictionaryRef entries)
    {
        if (std::ranges::find(_open, identity, &Open::identity) != _open.end())
            return fail("holds itself");
        Open container{identity, array, std::move(entries)};
        const bool isDictionary = container.entries != nullptr;
        if (container.size() == 0)
            return putLine(isDictionary ? "<dict/>\n" : "<array/>\n");
        putLine(isDictionary ? "<dict>\n" : "<array>\n");
        _open.push_back(std::move(container));
    }

    void putReal(double number)
    {
        if (number == 0)
            return putElement("real", "0.0");
        if (!std::isfinite(number)) {
            const char* infinity = number > 0 ? "+infinity" : "-infinity";
            return putElement("real", std::isnan(number) ? "nan" : infinity);
        }
        constexpr int kEnough = 17; // digits that distinguish any two doubles
        std::array<char, 32> digits;
        const auto end =
            std::to_chars(digits.begin(), digits.end(), number, std::chars_format::general, kEnough).ptr;
        putElement("real", {digits.begin(), end});
    }

    void putDate(Date date)
    {
        constexpr double kFirst = -62'135'596'800; // 0001-01-01
        constexpr double kEnd = 253'402'300'800;   // 10000-01-01
        if (!(date.secondsSince1970 >= kFirst && date.secondsSince1970 < kEnd))
            return fail("is a date outside of the years 1 to 9999");
        putElement("date", dateOf(date));
    }

    // Readers take integers out of range as reals, so it is written as one.
    void putUID(UID uid)
    {
        const bool isInteger = std::in_range<std::int64_t>(uid.number);
        const Value number = isInteger ? Value(uid.number) : Value(static_cast<double>(uid.number));
        open(&uid, nullptr, Dictionary::make({{"CF$UID", number}}));
    }

    // Base64 lines and groups continue across pieces.
    void putData(const std::vector<ByteView>& pieces)
    {
        static constexpr std::size_t kMostTabs = 8;
        static constexpr std::size_t kWidth = 76; // columns, a tab counting as eight
        const std::size_t tabs = std::min(_open.size(), kMostTabs);
        const std::size_t bytesALine = (kWidth - tabs * 8) / 4 * 3;
        putLine("<data>\n");
        Bytes line;
        const auto putBase64Line = [&] {
            _buffer.append(tabs, '\t');
            appendBase64(_buffer, line);
            put("\n");
            line.clear();
        };
        for (ByteView rest : pieces) {
            while (!rest.empty()) {
                const auto part = rest.first(std::min(bytesALine - line.size(), rest.size()));
                rest = rest.subspan(part.size());
                line.insert(line.end(), part.begin(), part.end());
                if (line.size() == bytesALine)
                    putBase64Line();
            }
        }
        if (!line.empty())
            putBase64Line();
        putLine("</data>\n");
    }

    void putElement(std::string_view name, std::string_view content)
    {
        indent();
        (_buffer += '<') += name;
        _buffer += '>';
        const std::string text = xmlText(content);
        for (std::string_view rest = text; !rest.empty();) {
            const std::size_t plain = std::min(rest.find_first_of("&<>"), rest.size());
            put(rest.substr(0, plain));
            rest.remove_prefix(plain);
            if (rest.empty())
                break;
            put(rest.front() == '&' ? "&amp;" : rest.front() == '<' ? "&lt;" : "&gt;");
            rest.remove_prefix(1);
        }
        (_buffer += "</") += name;
        put(">\n");
    }

    void indent() { _buffer.append(_open.size(), '\t'); }
    void putLine(std::string_view line)
    {
        indent();
        put(line);
    }
    void put(std::string_view text)
    {
        if (_buffer.size() + text.size() >= kPiece)
            flush();
        if (text.size() >= kPiece)
            _sink(text);
        else
            _buffer += text;
    }
    void flush()
    {
        _sink(_buffer);
        _buffer.clear();
    }

    void fail(const char* what)
    {
        std::string path;
        for (const Open& container : _open) {
            const std::size_t i = container.written - 1;
            path += '/';
            path += container.entries ? container.entry(i).key : std::to_string(i);
        }
        _fault = "the value at " + (path.empty() ? "/" : visibleText(path)) + ' ' + what;
    }

    const TextSink& _sink;
    std::string _buffer;
    std::vector<Open> _open;
    std::string _fault;
};
} // namespace

std::string writePropertyListXML(const Value& value, const TextSink& sink)
{
    return XMLWriter(sink).run(value);
}

std::optional<Bytes> propertyListXML(const Value& value)
{
    Bytes xml;
    const std::string fault = writePropertyListXML(
        value, [&xml](std::string_view piece) { xml.insert(xml.end(), piece.begin(), piece.end()); });
    return fault.empty() ? std::optional(std::move(xml)) : std::nullopt;
}

} // namespace orvex
