#pragma once

#include <functional>
#include <string_view>

namespace orvex {

// Developer lines that the system writes to its standard output, all through this one place, so that a tool
// whose standard output is a document can send them elsewhere.
using ConsoleSink = std::function<void(std::string_view line)>;

// Lines go to standard output until a sink is installed; an empty sink restores that.
void installConsole(ConsoleSink sink);

// Writes one line; the line break is added.
void writeConsoleLine(std::string_view line);

} // namespace orvex
