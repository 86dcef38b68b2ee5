#pragma once

#include <string>
#include <string_view>

namespace orvex {

inline constexpr std::size_t kLongestVisibleText = 4096;

// Makes a text from a peer or a file safe for a terminal, the log or a title. Control characters and invalid
// UTF-8 become escapes such as "\n" or "\x1b"; bidirectional controls and line and paragraph separators
// become
// "\u202e" and the like. A text longer than the limit is cut and ends in "…".
std::string visibleText(std::string_view text, std::size_t longest = kLongestVisibleText);

} // namespace orvex
