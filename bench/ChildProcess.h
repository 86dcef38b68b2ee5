#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include <sys/types.h>

namespace orvex::bench {

// A program that runs beside the benchmark: standard output comes here, standard error goes where ours goes
// unless it is of no interest.
class ChildProcess {
public:
    using Environment = std::vector<std::string>; // "NAME=VALUE", in place of ours or beside it

    enum class Errors { shown, dropped };

    // Throws std::runtime_error when it cannot be started.
    explicit ChildProcess(const std::vector<std::string>& arguments, const Environment& environment = {},
        Errors errors = Errors::shown);
    // Ends it.
    ~ChildProcess();
    ChildProcess(const ChildProcess&) = delete;
    ChildProcess& operator=(const ChildProcess&) = delete;

    // Waits until it has written something, for 30 seconds at most. False when it ended before, or did not.
    bool waitForOutput() const;

    struct End {
        bool isGood;         // exit status 0
        std::size_t peakKiB; // the most memory that it held
    };
    End waitForEnd();

private:
    pid_t _process = -1; // -1 once it has ended
    int _output = -1;
};

} // namespace orvex::bench
