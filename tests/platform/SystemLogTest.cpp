#include "FatalErrors.h"
#include "FileSystemLog.h"
#include "LinuxSystemLog.h"
#include "QueuedSystemLog.h"

#include "Environment.h"
#include "TextFormat.h"

#include <gmock/gmock.h>

#include <cstdarg>
#include <fstream>
#include <future>
#include <stdexcept>

#include <unistd.h>

// In the place of the C library's, to see what reaches it.
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

// Ends the process, well unless the writing does not.
void writeTo(const char* destination, const std::function<void(SystemLog&)>& write)
{
    setEnvironment("ORVEX_LOG", destination);
    const auto log = makeLinuxSystemLog("test");
    SystemLog::install(log.get());
    write(*log);
    log->flush();
    _exit(0);
}

TEST(LinuxSystemLogDeathTest, SyslogGetsThePriorityAsItIsAndStandardErrorGetsLines)
{
    const auto write = [](SystemLog& log) {
        log.write(Priority::error, "one");
        log.write(Priority::dlfFailure, "100% %s\n");
        log.write(Priority::notice, "");
    };
    const testing::ExitedWithCode well(0);
    EXPECT_EXIT(writeTo(nullptr, write), well, "^syslog 3 onesyslog 16 100% %s\nsyslog 5 $");
    EXPECT_EXIT(writeTo("stderr", write), well, "^<3>one\n<16>100% %s\n<5>\n$");
}

TEST(QueuedSystemLog, SlowWriterIsNotWaitedForAndLossesAreCounted)
{
    std::promise<void> stuck;
    std::promise<void> go;
    std::vector<std::string> written;
    constexpr std::size_t kWritten = 20'000;
    {
        QueuedSystemLog log([&](const QueuedSystemLog::Lines& lines) {
            if (written.empty()) {
                stuck.set_value();
                go.get_future().wait();
            }
            for (const auto& line : lines)
                written.emplace_back(line.text);
        });
        // The writer is stuck with the first line; of the others those are kept that fit the queue.
        log.write(Priority::notice, "0");
        stuck.get_future().wait();
        for (std::size_t i = 1; i < kWritten; ++i)
            log.write(Priority::notice, std::to_string(i));
        go.set_value();
        log.flush();
        constexpr std::size_t kKept = 1 + QueuedSystemLog::kMostLines;
        ASSERT_EQ(written.size(), kKept + 1);
        for (std::size_t i = 0; i < kKept; ++i)
            ASSERT_EQ(written[i], std::to_string(i));
        EXPECT_EQ(written.back(), std::to_string(kWritten - kKept) + " log lines were dropped");
        log.write(Priority::notice, "at the end");
    }
    EXPECT_EQ(written.back(), "at the end") << "the destructor writes what is queued";
}

TEST(FileSystemLog, KeepsEveryLineAndTellsOfAFullDisk)
{
    const std::string path = testing::TempDir() + "orvex-file-log-" + std::to_string(getpid());
    std::string expected = "<3>ends by itself\n";
    {
        FileSystemLog log(path);
        log.write(Priority::error, "ends by itself\n");
        for (int i = 0; i < 10'000; ++i) {
            log.write(Priority::dlfFailure, std::to_string(i));
            expected += "<16>" + std::to_string(i) + '\n';
        }
        log.flush();
        EXPECT_EQ(log.error(), "");
    }
    std::ifstream file(path);
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(file), {}), expected);
    unlink(path.c_str());

    const char* const faults[][2] = {
        {"/dev/full", "No space left on device"}, {"/nowhere/at/all", "No such file or directory"}};
    for (const auto& [bad, reason] : faults) {
        FileSystemLog log(bad);
        log.write(Priority::error, "x");
        log.flush();
        EXPECT_EQ(log.error(), text("%s: %s", bad, reason));
    }
}

TEST(FatalErrorsDeathTest, LastLineSaysWhatWasThrown)
{
    const struct {
        std::function<void()> fail;
        const char* line;
    } cases[] = {
        {[] { throw std::out_of_range("index 7 of 3"); },
            "<3>Fatal: uncaught exception of type std::out_of_range: index 7 of 3\n"},
        {[] { throw 7; }, "<3>Fatal: uncaught exception of type int\n"},
        {[] { std::terminate(); }, "<3>Fatal: terminated without an exception\n"},
    };
    for (const auto& test : cases) {
        const auto fail = [&](SystemLog&) noexcept {
            installFatalErrorHandler();
            test.fail();
        };
        EXPECT_EXIT(writeTo("stderr", fail), testing::KilledBySignal(SIGABRT), test.line);
    }
}

} // namespace
} // namespace orvex
