#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include <sys/types.h>

namespace orvex::bench {

// A program that runs beside the benchmark. Its standard output is read here; its standard error is inherited
// or dropped.
class ChildProcess {
public:
    using Environment = std::vector<std::string>; // "NAME=VALUE", added or overriding

    enum class Errors { shown, dropped };

    // Throws std::runtime_error if it cannot be started.
    explicit ChildProcess(const std::vector<std::string>& arguments, const Environment& environment = {},
        Errors errors = Errors::shown);
    // Kills it.
    ~ChildProcess();
    ChildProcess(const ChildProcess&) = delete;
    ChildProcess& operator=(const ChildProcess&) = delete;

    // Waits up to 30 seconds for output. False if it ended first or wrote nothing.
    bool waitForOutput() const;

    struct End {
        bool isGood;         // exit status 0
        std::size_t peakKiB; // peak memory
    };
    End waitForEnd();

private:
    pid_t _process = -1; // -1 once it has ended
    int _output = -1;
};

} // namespace orvex::bench
