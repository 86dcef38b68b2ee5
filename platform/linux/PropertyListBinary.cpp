// Writing binary property lists.

#include "PropertyList.h"

#include "DecimalPoint.h"
#include "PropertyListNode.h"

#include <plist/plist.h>

namespace orvex {

// By way of the text: libplist writes a negative number as one only when it has read it, and what has no form
// or exceeds the limits is found on the way.
std::optional<Bytes> propertyListBinary(const Value& value, const PropertyListLimits& limits)
{
    const auto xml = propertyListXML(value, limits);
    if (!xml)
        return std::nullopt;
    const DecimalPoint decimalPoint;
    plist_t parsed = nullptr;
    plist_from_xml(
        reinterpret_cast<const char*>(xml->data()), static_cast<std::uint32_t>(xml->size()), &parsed);
    const PropertyListNode root(parsed);
    char* list = nullptr;
    std::uint32_t length = 0;
    plist_to_bin(root.get(), &list, &length);
    std::optional<Bytes> result;
    if (list)
        result.emplace(list, list + length);
    plist_to_bin_free(list);
    return result;
}

} // namespace orvex
