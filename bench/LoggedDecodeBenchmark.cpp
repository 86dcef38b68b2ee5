// The same streams with the system log on, which gets a line for every section and packet: through the file
// that orvex-decode --log writes, and through the queue of the application's log. Both end in /dev/null, so
// that the figures are ours and not those of a disk.

#include "Benchmarks.h"
#include "DecodeLoop.h"

#include "LinuxSystemLog.h"

#include <benchmark/benchmark.h>

#include <atomic>
#include <cstdio>

namespace orvex::bench {
namespace {

constexpr const char* kNowhere = "/dev/null";

// A queue whose lines end nowhere, and which knows how many it was given and how many it wrote.
class CountedQueue final : public SystemLog {
public:
    CountedQueue() = default;
    ~CountedQueue() override
    {
        _queue.flush();
        std::fclose(_file);
    }
    CountedQueue(const CountedQueue&) = delete;
    CountedQueue& operator=(const CountedQueue&) = delete;

    void write(Priority priority, std::string_view line) override
    {
        ++_given;
        _queue.write(priority, line);
    }
    // Of a hundred lines that many were kept.
    double keptPercent()
    {
        _queue.flush();
        return _given == 0 ? 100 : 100.0 * static_cast<double>(_written) / static_cast<double>(_given);
    }

private:
    void writeAll(const QueuedSystemLog::Lines& lines)
    {
        std::string text;
        for (const auto& line : lines)
            appendLogLine(text, line.priority, line.text);
        std::fwrite(text.data(), 1, text.size(), _file);
        _written += lines.size();
    }

    std::FILE* _file = std::fopen(kNowhere, "we");
    std::size_t _given = 0;
    std::atomic<std::size_t> _written = 0;
    QueuedSystemLog _queue{[this](const QueuedSystemLog::Lines& lines) { writeAll(lines); }};
};

void decodeIntoFile(benchmark::State& state, const Technology& technology)
{
    FileSystemLog log(kNowhere);
    decodeInto(log, state, technology, recordedStream(technology), kOnceAtTheEnd);
}

// The queue drops lines when its thread cannot keep pace.
void decodeIntoQueue(benchmark::State& state, const Technology& technology)
{
    CountedQueue log;
    decodeInto(log, state, technology, recordedStream(technology), kOnceAtTheEnd);
    state.counters["kept %"] = log.keptPercent();
}

void decodeBasebandIntoFile(benchmark::State& state, const Technology& technology)
{
    FileSystemLog log(kNowhere);
    decodeInto(log, state, technology, basebandStream(technology), kOnceAtTheEnd);
}

} // namespace

void registerLoggedDecoding()
{
    for (const Technology& technology : kTechnologies) {
        registerDecode("decode+file", technology, decodeIntoFile);
        registerDecode("baseband+file", technology, decodeBasebandIntoFile);
        registerDecode("decode+queue", technology, decodeIntoQueue);
    }
}

} // namespace orvex::bench
