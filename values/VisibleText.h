#pragma once

#include <string>
#include <string_view>

namespace orvex {

inline constexpr std::size_t kLongestVisibleText = 4096;

// Makes a text from a peer or a file safe to show on a terminal, in the log or in a title. Control characters
// and bytes that are not UTF-8 become escapes such as "\n" or "\x1b"; embeddings, overrides and isolates of
// bidirectional text and the separators of lines and paragraphs become "\u202e" and the like. A longer text
// is cut and ends in "…".
std::string visibleText(std::string_view text, std::size_t longest = kLongestVisibleText);

} // namespace orvex
