#pragma once

#include <string>
#include <string_view>

namespace orvex {

// A text that a peer or a file chose, fit for a terminal, the system log or the title of a window: nothing in
// it moves the cursor, ends the line or turns the direction of writing. Control characters and bytes that are
// not UTF-8 become "\n", "\t" or "\x1b"; the controls of bidirectional text and the separators of lines and
// paragraphs become
// "\u202e". Of a text longer than 4 KB the beginning is left, and "…".
std::string visibleText(std::string_view text);

} // namespace orvex
