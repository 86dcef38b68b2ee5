#pragma once

#include "PropertyList.h"

#include <optional>
#include <string>
#include <string_view>

namespace orvex {

// Looks through an XML property list before the parser sees it, without recursion and without memory beyond
// the nesting it allows. Gives the fault in one line; none when the list keeps its limits and is well formed:
// known elements that are closed in order, one value in <plist>, keys and values in turn, numbers and dates
// that can be read. What two parsers could understand differently (markup inside quotes or a document type
// with declarations) is a fault, so that nothing can hide from the count.
std::optional<std::string> faultOfXMLPropertyList(std::string_view list, const PropertyListLimits& limits);

} // namespace orvex
