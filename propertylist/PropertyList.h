#pragma once

#include "Value.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace orvex {

// Limits on what a property list may hold, checked before memory is spent.
struct PropertyListLimits {
    std::size_t maximumBytes = std::size_t{64} << 20;
    std::size_t maximumDepth = 256;       // containers inside containers
    std::size_t maximumNodes = 2'000'000; // values and keys; shared ones count at each appearance
};

struct PropertyListResult {
    std::optional<Value> value;
    std::string error; // one line if there is no value
};

// Reads a property list in XML or binary form.
PropertyListResult propertyListFromData(ByteView data, const PropertyListLimits& limits = {});
// The same without copying the XML form, which is overwritten.
PropertyListResult propertyListFromData(Bytes&& data, const PropertyListLimits& limits = {});

// Receives a text piece by piece.
using TextSink = std::function<void(std::string_view piece)>;

// Writes the XML form, of any size. A UID becomes the usual dictionary with the one key CF$UID, a set an
// array. Returns one line that names the first value that XML cannot hold (null, a date outside the years 1
// to 9999, a container that holds itself), up to which the sink got the text; empty if there is none.
std::string writePropertyListXML(const Value& value, const TextSink& sink);
// The same in memory. None if XML cannot hold a value.
std::optional<Bytes> propertyListXML(const Value& value);
// The binary form. None if the value holds null or a container holds itself.
std::optional<Bytes> propertyListBinary(const Value& value);

} // namespace orvex
