#pragma once

#include "ConsoleOutput.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

// How a frame differs from plain text.
struct FrameLook {
    // The line of the body to begin with, where it can be scrolled. Absent: with the first, and the last line
    // says how much is missing.
    std::optional<std::size_t> firstLine = {};
    // Colours a line of the body that is already cut and padded.
    std::function<std::string(const std::string& fitted, std::size_t index)> paint = {};
};

// A screenful: the status line above the body, and room for one more line below. A body taller than the
// terminal goes into columns where these are wide enough to read. Lines are cut to their column.
std::vector<std::string> terminalFrame(const std::string& status, const std::vector<std::string>& body,
    TerminalSize size, const FrameLook& look = {});

// How many lines of a body of that many a frame shows at once.
std::size_t linesInFrame(std::size_t bodyLines, TerminalSize size);

// Cuts a text to a number of terminal cells, with an ellipsis where something is missing, and pads it with
// blanks if asked. The text is UTF-8 without control characters.
std::string fittedToCells(const std::string& text, int cells, bool padded);

} // namespace orvex
