#include "StandardOutput.h"

#include <cerrno>
#include <poll.h>
#include <sys/ioctl.h>
#include <unistd.h>
#include <utility>

namespace orvex {

StandardOutput::StandardOutput(std::function<void(int error)> onClosed)
    : _onClosed(std::move(onClosed))
    , _readerGone(STDOUT_FILENO, QSocketNotifier::Exception)
{
    QObject::connect(&_readerGone, &QSocketNotifier::activated, &_readerGone, [this] {
        pollfd output{.fd = STDOUT_FILENO, .events = 0, .revents = 0};
        if (::poll(&output, 1, 0) > 0
            && (output.revents & (POLLERR | POLLHUP)) != 0) // a pipe has one, a socket the other
            close(EPIPE);
    });
}

void StandardOutput::close(int error)
{
    _readerGone.setEnabled(false);
    if (const auto closed = std::exchange(_onClosed, nullptr))
        closed(error);
}

void StandardOutput::write(std::string_view text)
{
    while (!text.empty() && _onClosed) {
        const ssize_t written = ::write(STDOUT_FILENO, text.data(), text.size());
        if (written >= 0) {
            text.remove_prefix(static_cast<std::size_t>(written));
        } else if (errno != EINTR) {
            return close(errno);
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
