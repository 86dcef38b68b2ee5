#pragma once

#include "OrvexModelNode.h"

#include <nlohmann/json_fwd.hpp>

#include <string>

namespace orvex {

// The display tree as one JSON object: {"name", "path", "children"} for a branch, {"name", "path", "value"}
// for a leaf. Bytes that are not UTF-8 become U+FFFD.
nlohmann::ordered_json treeJson(const OrvexModelNode& root);

// The text of a JSON document, indented.
std::string documentText(const nlohmann::ordered_json& document);

} // namespace orvex
