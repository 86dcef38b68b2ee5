#pragma once

#include <optional>
#include <string_view>

namespace orvex {

// In characters.
struct TerminalSize {
    int columns = 80;
    int rows = 24;
};

// Where the console writes.
class ConsoleOutput {
public:
    virtual ~ConsoleOutput() = default;

    virtual void write(std::string_view text) = 0;
    // None when the output is no terminal. Asked before every frame, as a terminal may be resized.
    virtual std::optional<TerminalSize> terminalSize() const = 0;
};

} // namespace orvex
