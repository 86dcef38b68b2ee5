#pragma once

#include "ConsoleOutput.h"

#include <string>
#include <utility>

namespace orvex::test {

// Keeps what is written.
class RecordingOutput final : public ConsoleOutput {
public:
    void write(std::string_view text) override { written += text; }
    std::optional<TerminalSize> terminalSize() const override { return size; }
    std::string take() { return std::exchange(written, {}); }

    std::optional<TerminalSize> size;
    std::string written;
};

} // namespace orvex::test
