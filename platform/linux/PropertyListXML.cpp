// Writing property lists, the second half of PropertyList.h.

#include "PropertyList.h"

#include "DecimalPoint.h"
#include "PropertyListEpoch.h"
#include "PropertyListNode.h"
#include "XMLText.h"

#include "Array.h"
#include "Dictionary.h"

#include <plist/plist.h>

#include <cmath>
#include <limits>

namespace orvex {

namespace {
// Makes libplist's tree of a value. Values may share containers, even hold themselves: depth and number of
// nodes are counted as they are written.
class Writer {
public:
    explicit Writer(const PropertyListLimits& limits)
        : _limits(limits)
    {
    }

    // Null when the value has no form or exceeds the limits. Depth is the number of containers around it.
    PropertyListNode nodeOf(const Value& value, std::size_t depth)
    {
        if (!count(0))
            return nullptr;
        switch (value.kind()) {
        case Value::Kind::null: return nullptr;
        case Value::Kind::string: return textNode(*value.string());
        case Value::Kind::integer:
            // Without sign by name only: the text has one.
            return own(plist_new_uint(static_cast<std::uint64_t>(*value.integer())));
        case Value::Kind::real: return own(plist_new_real(*value.real()));
        case Value::Kind::boolean: return own(plist_new_bool(*value.boolean() ? 1 : 0));
        case Value::Kind::date: return dateNode(*value.date());
        case Value::Kind::data: return dataNode(*value.data());
        case Value::Kind::uid: return uidNode(*value.uid());
        case Value::Kind::set:
            return depth < _limits.maximumDepth ? arrayNode(*value.set()->elements, depth) : nullptr;
        case Value::Kind::array:
            return depth < _limits.maximumDepth ? arrayNode(*value.array(), depth) : nullptr;
        case Value::Kind::dictionary:
            return depth < _limits.maximumDepth ? dictionaryNode(*value.dictionary(), depth) : nullptr;
        }
        return nullptr;
    }

private:
    static PropertyListNode own(plist_t node) { return PropertyListNode(node); }

    bool count(std::size_t bytes)
    {
        _bytes += bytes;
        return ++_nodes <= _limits.maximumNodes && _bytes <= _limits.maximumBytes;
    }

    PropertyListNode textNode(const std::string& text)
    {
        _bytes += text.size();
        return _bytes <= _limits.maximumBytes ? own(plist_new_string(xmlText(text).c_str())) : nullptr;
    }

    PropertyListNode dataNode(const Bytes& data)
    {
        _bytes += data.size();
        if (_bytes > _limits.maximumBytes)
            return nullptr;
        return own(plist_new_data(reinterpret_cast<const char*>(data.data()), data.size()));
    }

    // Whole seconds, as the XML form has no others. libplist counts them in 32 bits: 1932 to 2069.
    static PropertyListNode dateNode(Date date)
    {
        const double seconds = std::floor(date.secondsSince1970 - kPropertyListEpoch);
        using Range = std::numeric_limits<std::int32_t>;
        if (!(seconds >= Range::min() && seconds <= Range::max()))
            return nullptr;
        return own(plist_new_date(static_cast<std::int32_t>(seconds), 0));
    }

    // XML has no UIDs; this is what others write for one.
    static PropertyListNode uidNode(UID uid)
    {
        auto node = own(plist_new_dict());
        plist_dict_set_item(node.get(), "CF$UID", plist_new_uint(uid.number));
        return node;
    }

    PropertyListNode arrayNode(const Array& array, std::size_t depth)
    {
        auto node = own(plist_new_array());
        for (const Value& element : array) {
            auto item = nodeOf(element, depth + 1);
            if (!item)
                return nullptr;
            plist_array_append_item(node.get(), item.release());
        }
        return node;
    }

    PropertyListNode dictionaryNode(const Dictionary& dictionary, std::size_t depth)
    {
        auto node = own(plist_new_dict());
        for (const Dictionary::Entry& entry : dictionary) {
            if (!count(entry.key.size()))
                return nullptr;
            auto item = nodeOf(entry.value, depth + 1);
            if (!item)
                return nullptr;
            plist_dict_set_item(node.get(), xmlText(entry.key).c_str(), item.release());
        }
        return node;
    }

    const PropertyListLimits& _limits;
    std::size_t _nodes = 0;
    std::size_t _bytes = 0;
};
} // namespace

std::optional<Bytes> propertyListXML(const Value& value, const PropertyListLimits& limits)
{
    const DecimalPoint decimalPoint;
    const PropertyListNode root = Writer(limits).nodeOf(value, 0);
    if (!root)
        return std::nullopt;
    char* xml = nullptr;
    std::uint32_t length = 0;
    plist_to_xml(root.get(), &xml, &length);
    std::optional<Bytes> result;
    if (xml && length <= limits.maximumBytes)
        result.emplace(xml, xml + length);
    plist_to_xml_free(xml);
    return result;
}

} // namespace orvex
