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
    std::string text = {}; // one UTF-8 character if the code is text
};

// The keys in one read from a terminal. Escape sequences arrive whole, so a lone escape character is the
// Escape key.
std::vector<TerminalKey> terminalKeysIn(std::string_view input);

} // namespace orvex
