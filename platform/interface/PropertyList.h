#pragma once

#include "Value.h"

#include <cstddef>
#include <optional>
#include <span>
#include <string>

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
PropertyListResult propertyListFromData(
    std::span<const std::uint8_t> data, const PropertyListLimits& limits = {});

// The XML form. None when the value holds null, which has no form, or exceeds the limits.
std::optional<Bytes> propertyListXML(const Value& value, const PropertyListLimits& limits = {});
// The binary form of the same; none when there is no XML form.
std::optional<Bytes> propertyListBinary(const Value& value, const PropertyListLimits& limits = {});

} // namespace orvex
