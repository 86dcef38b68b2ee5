// How fast recorded streams are decoded while nobody reads the system log.

#include "Benchmarks.h"
#include "RecordedStream.h"

#include "SystemLog.h"

#include <benchmark/benchmark.h>

namespace orvex::bench {
namespace {

constexpr std::size_t kMessagesPerRefresh = 4'000; // two seconds of a busy modem

// A log that nobody reads.
class DroppingLog final : public SystemLog {
public:
    void write(Priority, std::string_view) override { }
    bool wants(Priority) const override { return false; }
};

void decodeAll(benchmark::State& state, const char* technology, const std::vector<Bytes>& messages)
{
    DroppingLog log;
    SystemLog::install(&log);
    {
        const auto generator = makeGenerator(technology);
        Dictionary session;
        for (auto _ : state) {
            std::size_t count = 0;
            for (const Bytes& message : messages) {
                generator->updateState(session, message);
                if (++count % kMessagesPerRefresh == 0)
                    generator->generateLogUsingState(session); // hands over the raw packets
            }
        }
        countMessages(state, messages.size());
    }
    SystemLog::install(nullptr);
}

void decode(benchmark::State& state, const Technology& technology)
{
    decodeAll(state, technology.identifier, recordedStream(technology));
}

void decodeBaseband(benchmark::State& state, const Technology& technology)
{
    decodeAll(state, technology.identifier, basebandStream(technology));
}

} // namespace

void registerDecoding()
{
    for (const Technology& technology : kTechnologies) {
        const std::string name = technology.name;
        benchmark::RegisterBenchmark(("decode/" + name).c_str(), decode, technology)
            ->Unit(benchmark::kMillisecond);
        if (name != "ifx") // it has no packets, only property lists
            benchmark::RegisterBenchmark(("baseband/" + name).c_str(), decodeBaseband, technology)
                ->Unit(benchmark::kMillisecond);
    }
}

} // namespace orvex::bench
