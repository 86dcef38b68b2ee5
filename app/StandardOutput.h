#pragma once

#include "ConsoleOutput.h"

#include <functional>

namespace orvex {

// The process's standard output.
class StandardOutput final : public ConsoleOutput {
public:
    // The callback is called once, when nobody reads any more.
    explicit StandardOutput(std::function<void()> onClosed)
        : _onClosed(std::move(onClosed))
    {
    }

    void write(std::string_view text) override;
    std::optional<TerminalSize> terminalSize() const override;

private:
    std::function<void()> _onClosed;
};

} // namespace orvex
