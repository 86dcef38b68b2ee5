#pragma once

#include <cstddef>
#include <functional>
#include <map>
#include <string>

#include <sys/types.h>

namespace orvex {

// Does pieces of work in processes of their own, a number of them at a time. Processes, since decoding is
// made for one thread: its array lock, system log and console are those of the process. And a piece that ends
// its process takes nothing else with it.
class WorkerPool {
public:
    // What became of a piece of work.
    struct End {
        bool isGood = false; // its exit status was 0
        std::string death;   // why its process ended before its time, or never began; else empty
    };
    struct Work {
        std::size_t count = 0;
        // In the caller's process, before the piece is begun: not long before, and not long before it is
        // reported either, so that what it opens stays within bounds.
        std::function<void(std::size_t piece)> prepare;
        // In the worker. What it returns is the exit status.
        std::function<int(std::size_t piece)> perform;
        // In the caller's process, piece by piece in their order.
        std::function<void(std::size_t piece, const End& end)> report;
    };

    explicit WorkerPool(std::size_t workers)
        : _workers(workers)
    {
    }

    // Returns when all pieces are reported. The process may have no other children.
    void run(const Work& work);

private:
    void begin(const Work& work, std::size_t piece);
    void awaitOne();

    std::size_t _workers;
    std::map<pid_t, std::size_t> _running; // the piece that each is at
    std::map<std::size_t, End> _ended;     // not yet reported
};

} // namespace orvex
