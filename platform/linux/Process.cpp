#include "Process.h"

#include "SystemLog.h"

#include <array>
#include <atomic>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <memory>
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

std::atomic<int> theSignal = 0;
std::atomic<void (*)()> theLastAct = nullptr;
static_assert(std::atomic<int>::is_always_lock_free);

// Runs in the signal handler.
void startTheClock(int signal)
{
    if (theSignal.exchange(signal) == 0)
        ::alarm(kSecondsToEnd); // further signals do not put it off
}

// Interrupts whatever the process is stuck in.
extern "C" void die(int)
{
    if (void (*const act)() = theLastAct.load())
        act();
    std::signal(theSignal, SIG_DFL);
    std::raise(theSignal);
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
    : _pipe(
        kSignals,
        [handler = std::move(onSignal)](int) mutable {
            if (const auto once = std::exchange(handler, {}))
                once();
        },
        startTheClock)
{
    std::signal(SIGALRM, die); // outlives the object: the process may get stuck later
}

} // namespace orvex
