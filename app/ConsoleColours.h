#pragma once

#include <string>

namespace orvex {

// True if standard output is a terminal that is not dumb and $NO_COLOR is not set.
bool standardOutputTakesColours();

// Green while the session is up, otherwise yellow.
std::string colouredStatus(const std::string& status, bool isConnected);
// A line of the tree, possibly cut or padded: branches bold, values in cyan. `nameEnd` is that of the uncut
// line; a line without a value ends with its name.
std::string colouredLine(const std::string& line, std::size_t nameEnd);
// The line that a search has found.
std::string highlightedLine(const std::string& line);

// Shown in place of a branch that the tree does not have.
std::string nothingAt(const std::string& path);

} // namespace orvex
