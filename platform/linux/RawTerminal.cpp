#include "RawTerminal.h"

#include "Process.h"

#include <QSocketNotifier>

#include <array>
#include <atomic>
#include <cerrno>
#include <csignal>
#include <utility>

#include <termios.h>
#include <unistd.h>

namespace orvex {

namespace {

constexpr std::array kReported = {SIGTSTP, SIGCONT, SIGWINCH};
constexpr std::array kCrashes = {SIGABRT, SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGQUIT};

termios theModes{}; // as they were before ours
std::atomic<bool> theModesAreOurs = false;
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

} // namespace

RawTerminal::RawTerminal(Events events)
    : _events(std::move(events))
{
    _input = std::make_unique<QSocketNotifier>(STDIN_FILENO, QSocketNotifier::Read);
    QObject::connect(_input.get(), &QSocketNotifier::activated, _input.get(), [this] { readInput(); });
    _input->setEnabled(false);

    setLastAct(putBackTerminal);
    setSignalHandler(kCrashes, putBackAndCrash, SA_RESETHAND | SA_NODEFER);
    _signals.emplace(kReported, [this](int signal) { handle(signal); });
    readsKeys();
}

RawTerminal::~RawTerminal()
{
    _signals.reset();
    setSignalHandler(kCrashes, SIG_DFL, 0);
    setLastAct(nullptr);
    putBackTerminal();
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

void RawTerminal::handle(int signal)
{
    if (signal == SIGTSTP) {
        _input->setEnabled(false);
        putBackTerminal();
        ::raise(SIGSTOP);
        return;
    }
    readsKeys();
    _events.onRedraw();
}

} // namespace orvex
