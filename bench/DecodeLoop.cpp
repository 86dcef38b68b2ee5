#include "DecodeLoop.h"

#include "SystemLog.h"

#include <benchmark/benchmark.h>

namespace orvex::bench {

void decodeInto(SystemLog& log, benchmark::State& state, const Technology& technology,
    const std::vector<Bytes>& messages, std::size_t messagesPerRefresh)
{
    SystemLog::install(&log);
    {
        const auto generator = makeGenerator(technology.identifier);
        Dictionary session;
        for (auto _ : state) {
            std::size_t count = 0;
            for (const Bytes& message : messages) {
                generator->updateState(session, message);
                if (++count % messagesPerRefresh == 0)
                    generator->generateLogUsingState(session);
            }
            if (messagesPerRefresh == kOnceAtTheEnd)
                generator->generateLogUsingState(session);
        }
        countMessages(state, messages.size());
    }
    SystemLog::install(nullptr);
}

void registerDecode(const std::string& kind, const Technology& technology,
    void (*decode)(benchmark::State& state, const Technology& technology))
{
    benchmark::RegisterBenchmark((kind + '/' + technology.name).c_str(), decode, technology)
        ->Unit(benchmark::kMillisecond);
}

} // namespace orvex::bench
