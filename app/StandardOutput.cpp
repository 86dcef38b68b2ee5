#include "StandardOutput.h"

#include <cerrno>
#include <sys/ioctl.h>
#include <unistd.h>
#include <utility>

namespace orvex {

void StandardOutput::write(std::string_view text)
{
    while (!text.empty()) {
        const ssize_t written = ::write(STDOUT_FILENO, text.data(), text.size());
        if (written >= 0) {
            text.remove_prefix(static_cast<std::size_t>(written));
        } else if (errno != EINTR) {
            if (const auto closed = std::exchange(_onClosed, nullptr))
                closed();
            return;
        }
    }
}

std::optional<TerminalSize> StandardOutput::terminalSize() const
{
    if (!::isatty(STDOUT_FILENO))
        return std::nullopt;
    winsize size{};
    if (::ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) != 0 || size.ws_col == 0 || size.ws_row == 0)
        return TerminalSize{};
    return TerminalSize{.columns = size.ws_col, .rows = size.ws_row};
}

} // namespace orvex
