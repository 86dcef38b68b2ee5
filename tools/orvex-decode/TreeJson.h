#pragma once

#include "OrvexModelNode.h"

#include <string>

namespace orvex {

// The display tree as one JSON object: {"name", "path", "children"} for a branch, {"name", "path", "value"}
// for a leaf. Bytes that are not UTF-8 become U+FFFD.
std::string treeJson(const OrvexModelNode& root);

} // namespace orvex
