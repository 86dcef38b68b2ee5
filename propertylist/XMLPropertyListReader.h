#pragma once

#include "PropertyList.h"

#include <string_view>

namespace orvex {

// Reads a property list in its XML form, in one pass. Throws PropertyListFault unless the list keeps its
// limits and is well formed: known elements that are closed in order, one value in <plist>, keys and values
// in turn, numbers, dates and data that can be read. A document type may not declare anything, so no entity
// grows. Of two entries with one key the last counts.
Value readXMLPropertyList(std::string_view list, const PropertyListLimits& limits);

} // namespace orvex
