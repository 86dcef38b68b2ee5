// The monitor on a terminal of its own: whatever ends or stops it, the terminal's modes are as before.

#include "Programs.h"

#include <gtest/gtest.h>

#include <pty.h>
#include <sys/wait.h>
#include <termios.h>
#include <unistd.h>

namespace orvex::test {
namespace {

class TerminalProgram {
public:
    explicit TerminalProgram(const ProgramFolder& folder)
    {
        const winsize size{.ws_row = 24, .ws_col = 80, .ws_xpixel = 0, .ws_ypixel = 0};
        _process = ::forkpty(&_terminal, nullptr, nullptr, &size);
        if (_process == 0) {
            ::setenv("ORVEX_PORT_DIR", folder.ports().c_str(), 1);
            ::setenv("XDG_CONFIG_HOME", folder.ports().c_str(), 1);
            ::execl(ORVEX_PATH, "orvex", "--console", nullptr);
            ::_exit(127);
        }
    }
    ~TerminalProgram()
    {
        ::kill(_process, SIGKILL);
        ::waitpid(_process, nullptr, 0);
        ::close(_terminal);
    }
    TerminalProgram(const TerminalProgram&) = delete;
    TerminalProgram& operator=(const TerminalProgram&) = delete;

    bool isRaw() const
    {
        termios modes{};
        EXPECT_EQ(::tcgetattr(_terminal, &modes), 0);
        return (modes.c_lflag & (ICANON | ECHO)) == 0;
    }
    void type(char character) const { EXPECT_EQ(::write(_terminal, &character, 1), 1); }
    void send(int signal) const { ::kill(_process, signal); }
    // The status of waitpid() once it has ended or stopped.
    int waitForEndOrStop() const
    {
        int status = 0;
        EXPECT_TRUE(waitUntil([&] { return ::waitpid(_process, &status, WNOHANG | WUNTRACED) == _process; }));
        return status;
    }

private:
    pid_t _process = 0;
    int _terminal = -1;
};

TEST(ConsoleTerminal, GetsItsModesBackWhateverHappens)
{
    const std::tuple<const char*, char, int> cases[] = {
        {"q", 'q', 0},
        {"Ctrl+C", '\x03', 0},
        {"Ctrl+Z", '\x1a', 0},
        {"Ctrl+\\", '\x1c', 0},
        {"terminated", 0, SIGTERM},
        {"aborted", 0, SIGABRT},
    };
    for (const auto& [name, key, signal] : cases) {
        const ProgramFolder folder;
        const TerminalProgram monitor(folder);
        ASSERT_TRUE(waitUntil([&] { return monitor.isRaw(); })) << name;
        if (key != 0)
            monitor.type(key);
        else
            monitor.send(signal);
        const int status = monitor.waitForEndOrStop();
        EXPECT_FALSE(monitor.isRaw()) << name;
        if (!WIFSTOPPED(status))
            continue;
        monitor.send(SIGCONT);
        EXPECT_TRUE(waitUntil([&] { return monitor.isRaw(); })) << name << ", continued";
    }
}

} // namespace
} // namespace orvex::test
