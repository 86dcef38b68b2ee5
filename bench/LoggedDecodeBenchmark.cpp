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

class CountingLog final : public SystemLog {
public:
    void write(Priority, std::string_view) override { ++lines; }

    std::size_t lines = 0;
};

// Decodes a stream as often as the state says. Returns how often.
std::size_t decodeInto(SystemLog& log, benchmark::State& state, const Technology& technology)
{
    SystemLog::install(&log);
    const auto generator = makeGenerator(technology.identifier);
    const auto& messages = recordedStream(technology);
    Dictionary session;
    std::size_t rounds = 0;
    for (auto _ : state) {
        for (const Bytes& message : messages)
            generator->updateState(session, message);
        generator->generateLogUsingState(session);
        ++rounds;
    }
    SystemLog::install(nullptr);
    countMessages(state, messages.size());
    return rounds;
}

std::size_t linesOfOneRound(const Technology& technology)
{
    CountingLog log;
    SystemLog::install(&log);
    const auto generator = makeGenerator(technology.identifier);
    Dictionary session;
    for (const Bytes& message : recordedStream(technology))
        generator->updateState(session, message);
    SystemLog::install(nullptr);
    return log.lines;
}

void decodeIntoFile(benchmark::State& state, const Technology& technology)
{
    FileSystemLog log(kNowhere);
    decodeInto(log, state, technology);
}

// The queue drops lines when its thread cannot keep pace; how many of a hundred it kept is counted.
void decodeIntoQueue(benchmark::State& state, const Technology& technology)
{
    std::FILE* const file = std::fopen(kNowhere, "we");
    std::atomic<std::size_t> written = 0;
    std::size_t rounds = 0;
    {
        QueuedSystemLog log([&](const QueuedSystemLog::Lines& lines) {
            std::string text;
            for (const auto& line : lines)
                appendLogLine(text, line.priority, line.text);
            std::fwrite(text.data(), 1, text.size(), file);
            written += lines.size();
        });
        rounds = decodeInto(log, state, technology);
    }
    std::fclose(file);
    const auto wanted = static_cast<double>(rounds * linesOfOneRound(technology));
    state.counters["kept %"] = 100.0 * static_cast<double>(written) / wanted;
}

} // namespace

void registerLoggedDecoding()
{
    for (const Technology& technology : kTechnologies) {
        const std::string name = technology.name;
        benchmark::RegisterBenchmark(("decode+file/" + name).c_str(), decodeIntoFile, technology)
            ->Unit(benchmark::kMillisecond);
        benchmark::RegisterBenchmark(("decode+queue/" + name).c_str(), decodeIntoQueue, technology)
            ->Unit(benchmark::kMillisecond);
    }
}

} // namespace orvex::bench
