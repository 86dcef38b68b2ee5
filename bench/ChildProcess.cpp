#include "ChildProcess.h"

#include <algorithm>
#include <chrono>
#include <csignal>
#include <fstream>
#include <stdexcept>
#include <string_view>
#include <thread>

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

namespace orvex::bench {

namespace {
constexpr int kLongestWait = 30'000; // milliseconds
constexpr std::chrono::milliseconds kLook(1);

std::string_view nameIn(std::string_view assignment)
{
    return assignment.substr(0, assignment.find('='));
}

// A null-terminated vector for execve(). The texts must outlive it.
std::vector<char*> pointersTo(const std::vector<std::string>& texts)
{
    std::vector<char*> pointers;
    pointers.reserve(texts.size() + 1);
    for (const std::string& text : texts)
        pointers.push_back(const_cast<char*>(text.c_str()));
    pointers.push_back(nullptr);
    return pointers;
}

// Peak memory so far. The rusage that wait4() returns is of no use: it includes the time before exec, when
// the child still had its parent's memory.
std::size_t peakKiBOf(pid_t process)
{
    std::ifstream status("/proc/" + std::to_string(process) + "/status");
    std::string word;
    std::size_t peak = 0;
    while (status >> word) {
        if (word == "VmHWM:")
            status >> peak;
    }
    return peak;
}

std::vector<std::string> environmentWith(const ChildProcess::Environment& changes)
{
    std::vector<std::string> result = changes;
    for (char** variable = environ; *variable; ++variable) {
        bool isChanged = false;
        for (const std::string& change : changes)
            isChanged = isChanged || nameIn(change) == nameIn(*variable);
        if (!isChanged)
            result.emplace_back(*variable);
    }
    return result;
}
} // namespace

ChildProcess::ChildProcess(
    const std::vector<std::string>& arguments, const Environment& environment, Errors errors)
{
    int ends[2];
    if (pipe2(ends, O_CLOEXEC) != 0)
        throw std::runtime_error("no pipe");
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_adddup2(&actions, ends[1], STDOUT_FILENO);
    if (errors == Errors::dropped)
        posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, "/dev/null", O_WRONLY, 0);
    const auto variables = environmentWith(environment);
    const int error = posix_spawn(&_process, arguments.front().c_str(), &actions, nullptr,
        pointersTo(arguments).data(), pointersTo(variables).data());
    posix_spawn_file_actions_destroy(&actions);
    close(ends[1]);
    _output = ends[0];
    if (error != 0)
        throw std::runtime_error(arguments.front() + " could not be started");
}

ChildProcess::~ChildProcess()
{
    if (_process > 0) {
        kill(_process, SIGKILL);
        waitForEnd();
    }
    close(_output);
}

bool ChildProcess::waitForOutput() const
{
    pollfd wanted{_output, POLLIN, 0};
    char byte = 0;
    return poll(&wanted, 1, kLongestWait) == 1 && read(_output, &byte, 1) == 1;
}

ChildProcess::End ChildProcess::waitForEnd()
{
    std::size_t peakKiB = 0;
    int status = 0;
    while (waitpid(_process, &status, WNOHANG) == 0) {
        peakKiB = std::max(peakKiB, peakKiBOf(_process));
        std::this_thread::sleep_for(kLook);
    }
    _process = -1;
    return {WIFEXITED(status) && WEXITSTATUS(status) == 0, peakKiB};
}

} // namespace orvex::bench
