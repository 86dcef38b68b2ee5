#include "RawTerminal.h"

#include "Process.h"

#include <QSocketNotifier>

#include <array>
#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdint>
#include <span>
#include <stdexcept>
#include <utility>

#include <fcntl.h>
#include <termios.h>
#include <unistd.h>

namespace orvex {

namespace {

constexpr std::array kReported = {SIGTSTP, SIGCONT, SIGWINCH};
constexpr std::array kCrashes = {SIGABRT, SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGQUIT};

termios theModes{}; // as they were before ours
std::atomic<bool> theModesAreOurs = false;
std::atomic<int> theWriteEnd = -1;
static_assert(std::atomic<bool>::is_always_lock_free);

// A process in the background that sets the modes is stopped, unless it blocks the signal that says so.
bool setModes(const termios& modes)
{
    sigset_t blocked{};
    sigset_t former{};
    ::sigemptyset(&blocked);
    ::sigaddset(&blocked, SIGTTOU);
    ::pthread_sigmask(SIG_BLOCK, &blocked, &former);
    const bool isSet = ::tcsetattr(STDIN_FILENO, TCSANOW, &modes) == 0;
    ::pthread_sigmask(SIG_SETMASK, &former, nullptr);
    return isSet;
}

void takeTerminal()
{
    if (theModesAreOurs || ::tcgetpgrp(STDIN_FILENO) != ::getpgrp()
        || ::tcgetattr(STDIN_FILENO, &theModes) != 0)
        return;
    termios modes = theModes;
    modes.c_lflag &= ~static_cast<tcflag_t>(ICANON | ECHO);
    modes.c_cc[VMIN] = 1;
    modes.c_cc[VTIME] = 0;
    theModesAreOurs = true; // first: a signal may come in between
    theModesAreOurs = setModes(modes);
}

// May run in a signal handler.
void putBackTerminal()
{
    if (theModesAreOurs.exchange(false))
        setModes(theModes);
}

extern "C" void putBackAndCrash(int signal)
{
    putBackTerminal();
    ::raise(signal); // its handler was reset
}

extern "C" void reportToEventLoop(int signal)
{
    const int savedError = errno;
    const auto byte = static_cast<std::uint8_t>(signal);
    [[maybe_unused]] const ssize_t written = ::write(theWriteEnd.load(), &byte, 1);
    errno = savedError;
}

// For each of the numbers; "signals" is a macro of Qt's.
void setHandler(std::span<const int> numbers, void (*handler)(int), unsigned flags)
{
    struct sigaction action { };
    action.sa_handler = handler;
    action.sa_flags = static_cast<int>(flags);
    for (const int number : numbers)
        ::sigaction(number, &action, nullptr);
}

} // namespace

RawTerminal::RawTerminal(Events events)
    : _events(std::move(events))
{
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC | O_NONBLOCK) != 0)
        throw std::runtime_error("No pipe for signals");
    _readEnd = ends[0];
    _writeEnd = ends[1];
    theWriteEnd = _writeEnd;
    _signals = std::make_unique<QSocketNotifier>(_readEnd, QSocketNotifier::Read);
    QObject::connect(
        _signals.get(), &QSocketNotifier::activated, _signals.get(), [this] { handleSignals(); });
    _input = std::make_unique<QSocketNotifier>(STDIN_FILENO, QSocketNotifier::Read);
    QObject::connect(_input.get(), &QSocketNotifier::activated, _input.get(), [this] { readInput(); });
    _input->setEnabled(false);

    setLastAct(putBackTerminal);
    setHandler(kCrashes, putBackAndCrash, SA_RESETHAND | SA_NODEFER);
    setHandler(kReported, reportToEventLoop, SA_RESTART);
    readsKeys();
}

RawTerminal::~RawTerminal()
{
    setHandler(kReported, SIG_DFL, 0);
    setHandler(kCrashes, SIG_DFL, 0);
    setLastAct(nullptr);
    putBackTerminal();
    theWriteEnd = -1;
    _signals.reset();
    ::close(_readEnd);
    ::close(_writeEnd);
}

bool RawTerminal::readsKeys()
{
    takeTerminal();
    _input->setEnabled(theModesAreOurs);
    return theModesAreOurs;
}

void RawTerminal::readInput()
{
    std::array<char, 256> buffer{};
    const ssize_t count = ::read(STDIN_FILENO, buffer.data(), buffer.size());
    if (count > 0)
        _events.onInput(std::string_view(buffer.data(), static_cast<std::size_t>(count)));
    else if (count == 0 || errno != EINTR)
        _input->setEnabled(false); // the terminal has gone
}

void RawTerminal::handleSignals()
{
    std::uint8_t signal = 0;
    while (::read(_readEnd, &signal, 1) == 1) {
        if (signal == SIGTSTP) {
            _input->setEnabled(false);
            putBackTerminal();
            ::raise(SIGSTOP);
            continue;
        }
        readsKeys();
        _events.onRedraw();
    }
}

} // namespace orvex
