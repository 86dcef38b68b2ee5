#pragma once

#include "Value.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace orvex {

// Bounds that a property list must keep before it is looked into.
struct PropertyListLimits {
    std::size_t maximumBytes = std::size_t{64} << 20;
    std::size_t maximumDepth = 256;       // containers inside containers
    std::size_t maximumNodes = 2'000'000; // values and keys, shared ones counted wherever they appear
};

struct PropertyListResult {
    std::optional<Value> value;
    std::string error; // why there is no value, in one line
};

// Reads a property list in its XML or its binary form.
PropertyListResult propertyListFromData(ByteView data, const PropertyListLimits& limits = {});
// The same without a copy of the XML form, which does not survive.
PropertyListResult propertyListFromData(Bytes&& data, const PropertyListLimits& limits = {});

// Takes a text piece by piece.
using TextSink = std::function<void(std::string_view piece)>;

// Writes the XML form, of any size. XML has no UIDs, which become what others write for them, a dictionary
// with the one key CF$UID, and no sets, which become arrays. Returns one line that names the value without a
// form: null, a date outside of the years 1 to 9999, a container that holds itself. Empty when there is none;
// else the sink has got the text up to that value.
std::string writePropertyListXML(const Value& value, const TextSink& sink);
// The same in memory; none when a value has no form.
std::optional<Bytes> propertyListXML(const Value& value);
// The binary form. None when the value holds null or a container holds itself.
std::optional<Bytes> propertyListBinary(const Value& value);

} // namespace orvex
