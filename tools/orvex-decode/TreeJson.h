#pragma once

#include "JsonWriter.h"
#include "OrvexModelNode.h"

namespace orvex {

// Writes the display tree as one JSON object: {"name", "path", "children"} for a branch, {"name", "path",
// "value"} for a leaf.
//
// A tree that reaches 32 levels or more below its root is written compact and without paths. A path repeats
// every name above it, and indentation grows as well: a few KB of a hostile report would become gigabytes.
void writeTreeJson(JsonWriter& json, const OrvexModelNode& root);

} // namespace orvex
