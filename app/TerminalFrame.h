#pragma once

#include "ConsoleOutput.h"

#include <string>
#include <vector>

namespace orvex {

// One screenful: the status line above the body. A body that is higher than the terminal is set in two or
// more columns where these are wide enough to read, and if it still does not fit its last line says how much
// is missing. Lines are cut to their column.
std::vector<std::string> terminalFrame(
    const std::string& status, const std::vector<std::string>& body, TerminalSize size);

// The text cut to so many terminal cells, with an ellipsis where something was cut. Padded with blanks to
// that width when asked. The text is UTF-8 without control characters.
std::string fittedToCells(const std::string& text, int cells, bool padded);

} // namespace orvex
