// How fast recorded streams are decoded while nobody reads the system log.

#include "Benchmarks.h"
#include "RecordedStream.h"

#include "SystemLog.h"

#include <benchmark/benchmark.h>

namespace orvex::bench {
namespace {

// A log that nobody reads.
class DroppingLog final : public SystemLog {
public:
    void write(Priority, std::string_view) override { }
    bool wants(Priority) const override { return false; }
};

void decode(benchmark::State& state, const Technology& technology)
{
    DroppingLog log;
    SystemLog::install(&log);
    {
        const auto generator = makeGenerator(technology.identifier);
        const auto& messages = recordedStream(technology);
        Dictionary session;
        for (auto _ : state) {
            for (const Bytes& message : messages)
                generator->updateState(session, message);
            generator->generateLogUsingState(session); // hands over the raw packets, as every refresh does
        }
        countMessages(state, messages.size());
    }
    SystemLog::install(nullptr);
}

} // namespace

void registerDecoding()
{
    for (const Technology& technology : kTechnologies)
        benchmark::RegisterBenchmark((std::string("decode/") + technology.name).c_str(), decode, technology)
            ->Unit(benchmark::kMillisecond);
}

} // namespace orvex::bench
