#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace orvex {

// A key as a terminal sends it.
struct TerminalKey {
    enum class Code { up, down, pageUp, pageDown, home, end, enter, escape, backspace, redraw, text, other };

    bool operator==(const TerminalKey&) const = default;

    Code code = Code::other;
    std::string text = {}; // one character in UTF-8 where the code is text
};

// The keys in what was read from a terminal at once. An escape sequence comes whole; a lone escape character
// is the key of that name.
std::vector<TerminalKey> terminalKeysIn(std::string_view input);

} // namespace orvex
