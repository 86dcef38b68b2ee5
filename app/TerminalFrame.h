#pragma once

#include "ConsoleOutput.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

// The layout of a frame.
struct FrameLook {
    // First line of a body that can be scrolled. Absent: the body starts at its first line, and the last line
    // says how much is missing.
    std::optional<std::size_t> firstLine = {};
    // Colours a line of the body, already cut and padded.
    std::function<std::string(const std::string& fitted, std::size_t index)> paint = {};
};

// A screenful: the status line, the body, and room for one more line below. A body taller than the terminal
// is set in columns if they are wide enough to read. Lines are cut to their column.
std::vector<std::string> terminalFrame(const std::string& status, const std::vector<std::string>& body,
    TerminalSize size, const FrameLook& look = {});

// How many of the body's lines a frame shows at once.
std::size_t linesInFrame(std::size_t bodyLines, TerminalSize size);

// Cuts a text to a number of terminal cells, ending it in an ellipsis if it was longer, and pads it with
// blanks if asked. The text is UTF-8 without control characters.
std::string fittedToCells(const std::string& text, int cells, bool padded);

} // namespace orvex
