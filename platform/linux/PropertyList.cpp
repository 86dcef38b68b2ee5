#include "PropertyList.h"

#include "BinaryPropertyListBounds.h"
#include "PropertyListNode.h"
#include "XMLPropertyListBounds.h"

#include "Array.h"
#include "Dictionary.h"

#include <plist/plist.h>

#include <algorithm>
#include <bit>
#include <cstdlib>
#include <limits>

namespace orvex {

namespace {
struct Free {
    void operator()(void* memory) const { std::free(memory); } // NOLINT: libplist hands out malloc's memory
};

// The eight bytes of a number or date as the binary form has them, and the marker before them. The getters of
// libplist know neither a sign nor dates far from 2001.
struct Raw {
    std::uint8_t marker = 0;
    std::uint64_t bits = 0;
};

Raw rawValueOf(plist_t node)
{
    constexpr std::size_t kMarker = 8; // behind the header
    constexpr std::size_t kTrailer = 32 + 1;
    char* list = nullptr;
    std::uint32_t length = 0;
    plist_to_bin(node, &list, &length);
    const std::unique_ptr<char, Free> owner(list);
    Raw raw;
    if (!list || length < kMarker + 1 + sizeof raw.bits + kTrailer)
        return raw;
    raw.marker = static_cast<std::uint8_t>(list[kMarker]);
    for (std::size_t i = length - kTrailer - sizeof raw.bits; i < length - kTrailer; ++i)
        raw.bits = raw.bits << 8 | static_cast<std::uint8_t>(list[i]);
    return raw;
}

Value integerOf(plist_t node)
{
    constexpr std::uint8_t kWide = 0x14; // more than eight bytes with sign can hold
    std::uint64_t bits = 0;
    plist_get_uint_val(node, &bits);
    if (bits > std::numeric_limits<std::int64_t>::max() && rawValueOf(node).marker == kWide)
        return static_cast<double>(bits);
    return static_cast<std::int64_t>(bits);
}

Value valueOf(plist_t node);

Value arrayOf(plist_t node)
{
    auto array = Array::make();
    plist_array_iter cursor = nullptr;
    plist_array_new_iter(node, &cursor);
    const std::unique_ptr<void, Free> owner(cursor);
    for (;;) {
        plist_t item = nullptr;
        plist_array_next_item(node, cursor, &item);
        if (!item)
            return array;
        array->append(valueOf(item));
    }
}

Value dictionaryOf(plist_t node)
{
    auto dictionary = Dictionary::make();
    plist_dict_iter cursor = nullptr;
    plist_dict_new_iter(node, &cursor);
    const std::unique_ptr<void, Free> owner(cursor);
    for (;;) {
        char* key = nullptr;
        plist_t item = nullptr;
        plist_dict_next_item(node, cursor, &key, &item);
        const std::unique_ptr<char, Free> keyOwner(key);
        if (!item)
            return dictionary;
        dictionary->set(key ? key : "", valueOf(item));
    }
}

// Recursive: what comes here has passed the limit of depth.
Value valueOf(plist_t node)
{
    switch (plist_get_node_type(node)) {
    case PLIST_BOOLEAN: {
        std::uint8_t flag = 0;
        plist_get_bool_val(node, &flag);
        return flag != 0;
    }
    case PLIST_UINT: return integerOf(node);
    case PLIST_REAL: {
        double number = 0;
        plist_get_real_val(node, &number);
        return number;
    }
    case PLIST_STRING: {
        std::uint64_t length = 0;
        const char* text = plist_get_string_ptr(node, &length);
        return text ? std::string(text, length) : std::string();
    }
    case PLIST_DATE: return Date{std::bit_cast<double>(rawValueOf(node).bits) + kPropertyListEpoch};
    case PLIST_DATA: {
        std::uint64_t length = 0;
        const char* data = plist_get_data_ptr(node, &length);
        return data ? std::make_shared<Bytes>(data, data + length) : std::make_shared<Bytes>();
    }
    case PLIST_ARRAY: return arrayOf(node);
    case PLIST_DICT: return dictionaryOf(node);
    default: return {}; // the identifiers of archives, which mean nothing outside of them
    }
}

PropertyListResult failure(std::string why)
{
    return {std::nullopt, "No property list: " + std::move(why)};
}
} // namespace

PropertyListResult propertyListFromData(std::span<const std::uint8_t> data, const PropertyListLimits& limits)
{
    constexpr std::size_t kAddressable = std::numeric_limits<std::uint32_t>::max(); // by libplist
    const std::size_t longest = std::min(limits.maximumBytes, kAddressable);
    if (data.size() > longest)
        return failure("longer than " + std::to_string(longest) + " bytes");
    if (data.empty())
        return failure("no data");

    std::string_view text(reinterpret_cast<const char*>(data.data()), data.size());
    const bool isBinary = text.starts_with("bplist");
    constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
    if (text.starts_with(kByteOrderMark))
        text.remove_prefix(kByteOrderMark.size());
    if (const auto fault =
            isBinary ? faultOfBinaryPropertyList(data, limits) : faultOfXMLPropertyList(text, limits))
        return failure(*fault);

    const DecimalPoint decimalPoint;
    plist_t parsed = nullptr;
    const auto parse = isBinary ? plist_from_bin : plist_from_xml;
    parse(text.data(), static_cast<std::uint32_t>(text.size()), &parsed);
    const PropertyListNode root(parsed);
    if (!root)
        return failure("malformed");
    return {valueOf(root.get()), {}};
}

} // namespace orvex
