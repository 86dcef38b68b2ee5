#include "ConsoleOutput.h"

#include "OrvexApp.h"
#include "OrvexPaneController.h"

#include <QCoreApplication>
#include <QEvent>

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

StatusPrinter::StatusPrinter(const OrvexApp& app, ConsoleOutput& output)
    : _app(app)
    , _output(output)
{
    QCoreApplication::instance()->installEventFilter(this);
}

StatusPrinter::~StatusPrinter()
{
    QCoreApplication::instance()->removeEventFilter(this);
}

bool StatusPrinter::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() != QEvent::Paint || !_app.navigationStack() || !_app.model())
        return false;
    const auto& screen = static_cast<OrvexPaneController&>(_app.navigationStack()->topScreen());
    const QLabel* const label = screen.statusLabel();
    // Old labels are drawn too while they dissolve.
    if (watched != label || label->text() == _last)
        return false;
    _last = label->text();
    _output.write(std::to_string(_app.model()->decodedMessages()) + ' ' + _last.toStdString() + '\n');
    return false;
}

} // namespace orvex
