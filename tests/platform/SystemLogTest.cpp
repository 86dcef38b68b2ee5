#include "LinuxSystemLog.h"
#include "Process.h"

#include "Environment.h"

#include <gmock/gmock.h>

#include <csignal>
#include <cstdarg>
#include <future>
#include <stdexcept>

#include <unistd.h>

// Replaces the C library's, to show what reaches it.
extern "C" [[gnu::format(printf, 2, 3)]] void syslog(int priority, const char* format, ...);

void syslog(int priority, const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    std::fprintf(stderr, "syslog %d ", priority);
    std::vfprintf(stderr, format, arguments);
    va_end(arguments);
}

namespace orvex {
namespace {

using test::setEnvironment;

// Exits with 0 unless writing ends the process first.
void writeTo(const char* destination, const std::function<void(SystemLog&)>& write)
{
    setEnvironment("ORVEX_LOG", destination);
    const auto log = makeLinuxSystemLog("test");
    SystemLog::install(log.get());
    write(*log);
    log->flush();
    _exit(0);
}

TEST(LinuxSystemLogDeathTest, SyslogGetsItsOwnPrioritiesAndStandardErrorGetsLines)
{
    const auto write = [](SystemLog& log) {
        log.write(Priority::error, "one");
        log.write(Priority::dlfFailure, "100% %s\n");
        log.write(Priority::notice, "");
    };
    const testing::ExitedWithCode well(0);
    EXPECT_EXIT(writeTo(nullptr, write), well, "^syslog 3 onesyslog 3 <16>100% %s\nsyslog 5 $");
    EXPECT_EXIT(writeTo("stderr", write), well, "^<3>one\n<16>100% %s\n<5>\n$");
}

TEST(QueuedSystemLog, NobodyWaitsForASlowWriterAndLossesAreCounted)
{
    std::promise<void> stuck;
    std::promise<void> go;
    std::vector<std::string> written;
    {
        QueuedSystemLog log([&](const QueuedSystemLog::Lines& lines) {
            if (written.empty()) {
                stuck.set_value();
                go.get_future().wait();
            }
            for (const auto& line : lines)
                written.emplace_back(line.text);
        });
        // While the writer is stuck with the first line, the queue fills up.
        for (std::size_t i = 0; i < QueuedSystemLog::kMostLines + 8; ++i) {
            log.write(Priority::notice, std::to_string(i));
            if (i == 0)
                stuck.get_future().wait();
        }
        go.set_value();
        log.flush();
        ASSERT_EQ(written.size(), QueuedSystemLog::kMostLines + 2);
        for (std::size_t i = 0; i < written.size() - 1; ++i)
            ASSERT_EQ(written[i], std::to_string(i));
        EXPECT_EQ(written.back(), "7 log lines were dropped");
        log.write(Priority::notice, "at the end");
    }
    EXPECT_EQ(written.back(), "at the end") << "the destructor writes what is queued";
}

// Signal handlers run on the main thread.
TEST(QueuedSystemLog, ItsThreadTakesNoSignals)
{
    sigset_t blocked{};
    {
        QueuedSystemLog log([&blocked](const auto&) { pthread_sigmask(SIG_SETMASK, nullptr, &blocked); });
        log.write(Priority::notice, "x");
    }
    sigset_t own{};
    pthread_sigmask(SIG_SETMASK, nullptr, &own);
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGALRM, SIGCHLD, SIGUSR1}) {
        EXPECT_EQ(sigismember(&blocked, signal), 1) << signal;
        EXPECT_EQ(sigismember(&own, signal), 0) << signal;
    }
}

TEST(FatalErrorsDeathTest, LastLineSaysWhatWasThrown)
{
    const std::pair<void (*)(), const char*> cases[] = {
        {[] { throw std::out_of_range("7 of 3"); }, "uncaught exception of type std::out_of_range: 7 of 3"},
        {[] { throw 7; }, "uncaught exception of type int"},
        {[] { std::terminate(); }, "terminated without an exception"},
    };
    for (const auto& [fault, line] : cases) {
        const auto fail = [&fault = fault](SystemLog&) noexcept {
            installFatalErrorHandler();
            fault();
        };
        EXPECT_EXIT(writeTo("stderr", fail), testing::KilledBySignal(SIGABRT),
            "<3>Fatal: " + std::string(line) + "\n");
    }
}

} // namespace
} // namespace orvex
