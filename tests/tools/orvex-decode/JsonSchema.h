#pragma once

#include <string>

namespace orvex::test {

// What the installed JSON Schema has against a document; empty for nothing.
std::string schemaFaults(const std::string& document);

} // namespace orvex::test
