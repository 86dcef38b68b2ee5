#include "TerminationSignals.h"

#include <array>
#include <atomic>
#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <stdexcept>
#include <unistd.h>
#include <utility>

namespace orvex {

namespace {
constexpr std::array kSignals = {SIGINT, SIGTERM, SIGHUP};

constexpr unsigned kSecondsToEnd = 1;

std::atomic<int> theWriteEnd = -1;
std::atomic<int> theSignal = 0;
static_assert(std::atomic<int>::is_always_lock_free);

// Writing to a pipe is all a handler may do here; the event loop reads the other end.
extern "C" void passToEventLoop(int signal)
{
    const int savedError = errno;
    if (theSignal.exchange(signal) == 0)
        ::alarm(kSecondsToEnd); // not put off by further signals
    const char byte = 1;
    [[maybe_unused]] const ssize_t written =
        ::write(theWriteEnd.load(), &byte, 1); // a full pipe is told already
    errno = savedError;
}

// Interrupts whatever the process is stuck in.
extern "C" void die(int)
{
    std::signal(theSignal, SIG_DFL);
    std::raise(theSignal);
}

void setHandler(void (*handler)(int))
{
    struct sigaction action { };
    action.sa_handler = handler;
    action.sa_flags = SA_RESTART;
    for (const int signal : kSignals)
        ::sigaction(signal, &action, nullptr);
}
} // namespace

TerminationSignals::TerminationSignals(std::function<void()> onSignal)
{
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC | O_NONBLOCK) != 0)
        throw std::runtime_error("No pipe for signals");
    _readEnd = ends[0];
    _writeEnd = ends[1];
    theWriteEnd = _writeEnd;
    _notifier = std::make_unique<QSocketNotifier>(_readEnd, QSocketNotifier::Read);
    QObject::connect(
        _notifier.get(), &QSocketNotifier::activated, _notifier.get(), [this, handler = std::move(onSignal)] {
            char byte = 0;
            while (::read(_readEnd, &byte, 1) > 0) { }
            handler();
        });
    std::signal(SIGALRM, die); // stays when the object goes: the process may get stuck later
    setHandler(passToEventLoop);
}

TerminationSignals::~TerminationSignals()
{
    setHandler(SIG_DFL);
    theWriteEnd = -1;
    _notifier.reset();
    ::close(_readEnd);
    ::close(_writeEnd);
}

} // namespace orvex
