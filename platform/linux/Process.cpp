#include "Process.h"

#include "SystemLog.h"

#include <QSocketNotifier>

#include <array>
#include <atomic>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <stdexcept>
#include <thread>
#include <typeinfo>
#include <utility>

#include <cxxabi.h>
#include <fcntl.h>
#include <unistd.h>

namespace orvex {

namespace {
constexpr std::array kSignals = {SIGINT, SIGTERM, SIGHUP};
constexpr unsigned kSecondsToEnd = 1;

std::atomic<int> theWriteEnd = -1;
std::atomic<int> theSignal = 0;
std::atomic<void (*)()> theLastAct = nullptr;
static_assert(std::atomic<int>::is_always_lock_free);

// Writing to a pipe is all a handler may do here; the event loop reads the other end.
extern "C" void passToEventLoop(int signal)
{
    const int savedError = errno;
    if (theSignal.exchange(signal) == 0)
        ::alarm(kSecondsToEnd); // further signals do not put it off
    const char byte = 1;
    // A full pipe will wake the event loop anyway.
    [[maybe_unused]] const ssize_t written = ::write(theWriteEnd.load(), &byte, 1);
    errno = savedError;
}

// Interrupts whatever the process is stuck in.
extern "C" void die(int)
{
    if (void (*const act)() = theLastAct.load())
        act();
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

struct Free {
    void operator()(char* memory) const { std::free(memory); } // NOLINT: the demangler uses malloc
};

std::string readableName(const std::type_info& type)
{
    int status = 0;
    const std::unique_ptr<char, Free> name(abi::__cxa_demangle(type.name(), nullptr, nullptr, &status));
    return name ? name.get() : type.name();
}

std::string descriptionOfCurrentException()
{
    const std::type_info* type = abi::__cxa_current_exception_type();
    if (!type)
        return "terminated without an exception";
    std::string description = "uncaught exception of type " + readableName(*type);
    try {
        throw;
    } catch (const std::exception& exception) {
        description += std::string(": ") + exception.what();
    } catch (...) { // NOLINT(bugprone-empty-catch): the type is all there is to say
    }
    return description;
}

[[noreturn]] void logAndAbort()
{
    static std::atomic_flag isTaken = ATOMIC_FLAG_INIT;
    thread_local bool isLogging = false;
    if (std::exchange(isLogging, true))
        std::abort(); // logging failed in turn
    if (isTaken.test_and_set()) {
        // Another thread is logging and will end the process.
        std::this_thread::sleep_for(std::chrono::seconds(10));
        std::abort();
    }
    const std::string description = descriptionOfCurrentException();
    if (SystemLog* log = SystemLog::installed()) {
        systemLog(Priority::error, "Fatal: %s", description.c_str());
        log->flush();
    } else {
        std::fprintf(stderr, "Fatal: %s\n", description.c_str());
    }
    std::abort();
}
} // namespace

QStringList argumentTexts(int count, const char* const* arguments)
{
    QStringList texts;
    for (int i = 0; i < count; ++i)
        texts.append(QString::fromLatin1(arguments[i]));
    return texts;
}

std::string argumentBytes(const QString& text)
{
    return text.toLatin1().toStdString();
}

void occupyStandardStreams()
{
    for (const int stream : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        // open() takes the lowest free number, which is this one.
        const bool isMissing = ::fcntl(stream, F_GETFD) < 0 && errno == EBADF;
        if (isMissing && ::open("/dev/null", O_RDONLY) != stream)
            std::_Exit(EXIT_FAILURE);
    }
}

void installFatalErrorHandler()
{
    std::set_terminate(logAndAbort);
}

void setLastAct(void (*act)())
{
    theLastAct = act;
}

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
    std::signal(SIGALRM, die); // outlives the object: the process may get stuck later
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
