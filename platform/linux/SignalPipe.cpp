#include "SignalPipe.h"

#include <QSocketNotifier>

#include <array>
#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstddef>
#include <cstdint>
#include <stdexcept>
#include <utility>

#include <fcntl.h>
#include <unistd.h>

namespace orvex {

namespace {

// What the handler of a signal needs.
struct Route {
    std::atomic<int> writeEnd;
    std::atomic<SignalPipe::InHandler> inHandler;
};
std::array<Route, NSIG> theRoutes;
static_assert(
    std::atomic<int>::is_always_lock_free && std::atomic<SignalPipe::InHandler>::is_always_lock_free);

extern "C" void passToEventLoop(int number)
{
    const int savedError = errno;
    const Route& route = theRoutes[static_cast<std::size_t>(number)];
    if (const SignalPipe::InHandler inHandler = route.inHandler)
        inHandler(number);
    const auto byte = static_cast<std::uint8_t>(number);
    // A full pipe will wake the event loop anyway.
    [[maybe_unused]] const ssize_t written = ::write(route.writeEnd, &byte, 1);
    errno = savedError;
}

} // namespace

void setSignalHandler(std::span<const int> numbers, void (*handler)(int), unsigned flags)
{
    struct sigaction action { };
    action.sa_handler = handler;
    action.sa_flags = static_cast<int>(flags);
    for (const int number : numbers)
        ::sigaction(number, &action, nullptr);
}

SignalPipe::SignalPipe(
    std::span<const int> numbers, std::function<void(int number)> onSignal, InHandler inHandler)
    : _numbers(numbers.begin(), numbers.end())
    , _onSignal(std::move(onSignal))
{
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC | O_NONBLOCK) != 0)
        throw std::runtime_error("No pipe for signals");
    _readEnd = ends[0];
    _writeEnd = ends[1];
    _notifier = std::make_unique<QSocketNotifier>(_readEnd, QSocketNotifier::Read);
    QObject::connect(
        _notifier.get(), &QSocketNotifier::activated, _notifier.get(), [this] { readNumbers(); });
    for (const int number : _numbers) {
        Route& route = theRoutes[static_cast<std::size_t>(number)];
        route.inHandler = inHandler;
        route.writeEnd = _writeEnd;
    }
    setSignalHandler(_numbers, passToEventLoop, SA_RESTART);
}

SignalPipe::~SignalPipe()
{
    setSignalHandler(_numbers, SIG_DFL, 0);
    for (const int number : _numbers)
        theRoutes[static_cast<std::size_t>(number)].writeEnd =
            -1; // a handler may still run in another thread
    _notifier.reset();
    ::close(_readEnd);
    ::close(_writeEnd);
}

void SignalPipe::readNumbers()
{
    std::uint8_t number = 0;
    while (::read(_readEnd, &number, 1) == 1)
        _onSignal(number);
}

} // namespace orvex
