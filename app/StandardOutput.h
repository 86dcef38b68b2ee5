#pragma once

#include "ConsoleOutput.h"

#include <QSocketNotifier>

#include <functional>

namespace orvex {

// The process's standard output.
class StandardOutput final : public ConsoleOutput {
public:
    // The callback is called once, when nothing can be written any more, with the error: EPIPE when nobody
    // reads, which is noticed without writing.
    explicit StandardOutput(std::function<void(int error)> onClosed);

    void write(std::string_view text) override;
    std::optional<TerminalSize> terminalSize() const override;

private:
    void close(int error);

    std::function<void(int error)> _onClosed;
    QSocketNotifier _readerGone;
};

} // namespace orvex
