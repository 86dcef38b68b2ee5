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

namespace {
std::vector<std::string> theSyslog;
}

// In the place of the C library's, to see what reaches it.
extern "C" [[gnu::format(printf, 2, 3)]] void syslog(int priority, const char* format, ...);

void syslog(int priority, const char* format, ...)
{
    std::string line;
    std::va_list arguments;
    va_start(arguments, format);
    orvex::formatInto(line, format, arguments);
    va_end(arguments);
    theSyslog.push_back(std::to_string(priority) + ' ' + line);
}

namespace orvex {
namespace {

using test::Environment;
using testing::ElementsAre;

TEST(LinuxSystemLog, SyslogGetsThePriorityAsItIs)
{
    const Environment destination("ORVEX_LOG", nullptr);
    const auto log = makeLinuxSystemLog("test");
    log->write(Priority::error, "one");
    log->write(Priority::dlfFailure, "100% %s\n");
    log->flush();
    EXPECT_THAT(theSyslog, ElementsAre("3 one", "16 100% %s\n"));
}

TEST(LinuxSystemLogDeathTest, StandardErrorGetsLines)
{
    EXPECT_EXIT(
        {
            const Environment destination("ORVEX_LOG", "stderr");
            const auto log = makeLinuxSystemLog("test");
            log->write(Priority::error, "one");
            log->write(Priority::dlfFailure, "ends by itself\n");
            log->write(Priority::notice, "");
            log->flush();
            _exit(0);
        },
        testing::ExitedWithCode(0), "^<3>one\n<16>ends by itself\n<5>\n$");
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
                written.push_back(line.text);
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
    {
        FileSystemLog log(path);
        for (int i = 0; i < 10'000; ++i)
            log.write(i % 2 ? Priority::dlfFailure : Priority::warning, "line " + std::to_string(i));
        log.write(Priority::error, "ends by itself\n");
        log.flush();
        EXPECT_EQ(log.error(), "");
    }
    std::string expected;
    for (int i = 0; i < 10'000; ++i)
        expected += (i % 2 ? "<16>line " : "<4>line ") + std::to_string(i) + '\n';
    std::ifstream file(path);
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(file), {}), expected + "<3>ends by itself\n");
    unlink(path.c_str());

    FileSystemLog full("/dev/full");
    full.write(Priority::error, "x");
    full.flush();
    EXPECT_EQ(full.error(), "/dev/full: No space left on device");
    FileSystemLog nowhere("/nowhere/at/all");
    nowhere.write(Priority::error, "x");
    nowhere.flush();
    EXPECT_EQ(nowhere.error(), "/nowhere/at/all: No such file or directory");
}

class LampError { };
class RangeError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

TEST(FatalErrorsDeathTest, LastLineSaysWhatWasThrown)
{
    const struct {
        std::function<void()> fail;
        const char* line;
    } cases[] = {
        {[] { throw RangeError("index 7 of 3"); },
            "<3>Fatal: uncaught exception of type orvex::.*RangeError: index 7 of 3\n"},
        {[] { throw LampError(); }, "<3>Fatal: uncaught exception of type orvex::.*LampError\n"},
        {[] { throw 7; }, "<3>Fatal: uncaught exception of type int\n"},
        {[] { std::terminate(); }, "<3>Fatal: terminated without an exception\n"},
    };
    for (const auto& test : cases) {
        EXPECT_EXIT(
            {
                const Environment destination("ORVEX_LOG", "stderr");
                const auto log = makeLinuxSystemLog("test");
                SystemLog::install(log.get());
                installFatalErrorHandler();
                [&]() noexcept { test.fail(); }();
            },
            testing::KilledBySignal(SIGABRT), test.line);
    }
}

} // namespace
} // namespace orvex
