// The same streams with the system log on, which gets a line for every section and packet: through the file
// that orvex-decode --log writes, and through the queue of the application's log. Both end in /dev/null, so
// that the figures are ours and not those of a disk.

#include "Benchmarks.h"
#include "RecordedStream.h"

#include "FileSystemLog.h"
#include "QueuedSystemLog.h"

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

void decodeInto(
    SystemLog& log, benchmark::State& state, const Technology& technology, const std::vector<Bytes>& messages)
{
    SystemLog::install(&log);
    {
        const auto generator = makeGenerator(technology.identifier);
        Dictionary session;
        for (auto _ : state) {
            for (const Bytes& message : messages)
                generator->updateState(session, message);
            generator->generateLogUsingState(session);
        }
        countMessages(state, messages.size());
    }
    SystemLog::install(nullptr);
}

void decodeIntoFile(benchmark::State& state, const Technology& technology)
{
    FileSystemLog log(kNowhere);
    decodeInto(log, state, technology, recordedStream(technology));
}

// The queue drops lines when its thread cannot keep pace.
void decodeIntoQueue(benchmark::State& state, const Technology& technology)
{
    CountedQueue log;
    decodeInto(log, state, technology, recordedStream(technology));
    state.counters["kept %"] = log.keptPercent();
}

void decodeBasebandIntoFile(benchmark::State& state, const Technology& technology)
{
    FileSystemLog log(kNowhere);
    decodeInto(log, state, technology, basebandStream(technology));
}

} // namespace

void registerLoggedDecoding()
{
    for (const Technology& technology : kTechnologies) {
        const std::string name = technology.name;
        benchmark::RegisterBenchmark(("decode+file/" + name).c_str(), decodeIntoFile, technology)
            ->Unit(benchmark::kMillisecond);
        benchmark::RegisterBenchmark(("baseband+file/" + name).c_str(), decodeBasebandIntoFile, technology)
            ->Unit(benchmark::kMillisecond);
        benchmark::RegisterBenchmark(("decode+queue/" + name).c_str(), decodeIntoQueue, technology)
            ->Unit(benchmark::kMillisecond);
    }
}

} // namespace orvex::bench
