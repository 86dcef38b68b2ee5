#include "WorkerPool.h"

#include "TextFormat.h"

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <cstring>

#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace orvex {

namespace {
// How many pieces each worker may be ahead of the oldest one that is still at work.
constexpr std::size_t kLead = 16;
} // namespace

void WorkerPool::run(const Work& work)
{
    std::signal(SIGCHLD, SIG_DFL); // where it is ignored, as some shells do, nobody learns of an end
    std::size_t begun = 0;
    for (std::size_t reported = 0; reported < work.count; ++reported) {
        while (!_ended.contains(reported)) {
            const bool mayBegin =
                begun < work.count && _running.size() < _workers && begun - reported < kLead * _workers;
            if (mayBegin)
                begin(work, begun++);
            else
                awaitOne();
        }
        work.report(reported, _ended.extract(reported).mapped());
    }
}

void WorkerPool::begin(const Work& work, std::size_t piece)
{
    work.prepare(piece);
    const pid_t parent = getpid();
    const pid_t worker = fork();
    if (worker == 0) {
        prctl(PR_SET_PDEATHSIG, SIGKILL); // nobody would take its result
        if (getppid() != parent)
            _exit(EXIT_FAILURE);
        _exit(work.perform(piece)); // what the parent has still to write is not the worker's to write
    }
    if (worker > 0)
        _running[worker] = piece;
    else
        _ended[piece] = {false, std::strerror(errno)}; // NOLINT(concurrency-mt-unsafe): there is one thread
}

void WorkerPool::awaitOne()
{
    int status = 0;
    const pid_t worker = wait(&status);
    const auto running = _running.find(worker);
    if (running == _running.end())
        return; // interrupted
    End end{WIFEXITED(status) && WEXITSTATUS(status) == 0, {}};
    if (WIFSIGNALED(status))
        end.death = text("ended by signal %d (%s)", WTERMSIG(status), strsignal(WTERMSIG(status))); // NOLINT
    _ended[running->second] = std::move(end);
    _running.erase(running);
}

} // namespace orvex
