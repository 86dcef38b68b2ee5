// Two floors for every figure: copying each message, and formatting numbers. A decoder as fast as the second
// spends its time on formatting alone.

#include "Benchmarks.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstring>
#include <string>

namespace orvex::bench {
namespace {

// Copies every message of a recorded stream.
void copyFloor(benchmark::State& state, const Technology& technology)
{
    const auto& messages = recordedStream(technology);
    Bytes buffer(std::ranges::max(messages, {}, &Bytes::size).size());
    for (auto _ : state) {
        for (const Bytes& message : messages) {
            std::memcpy(buffer.data(), message.data(), message.size());
            benchmark::ClobberMemory();
        }
    }
    countMessages(state, messages.size());
}

// Formats eight integers per message, into strings that keep their storage.
void printFloor(benchmark::State& state)
{
    constexpr std::size_t kMessages = 20'000;
    std::array<std::string, 8> rows;
    int value = 0;
    for (auto _ : state) {
        for (std::size_t message = 0; message < kMessages; ++message) {
            for (std::string& row : rows) {
                std::array<char, 32> text{};
                const int length = std::snprintf(text.data(), text.size(), "%d", value++);
                row.assign(text.data(), static_cast<std::size_t>(length));
            }
            benchmark::DoNotOptimize(rows);
        }
    }
    countMessages(state, kMessages);
}

} // namespace

void registerFloors()
{
    for (const Technology& technology : kTechnologies)
        benchmark::RegisterBenchmark((std::string("copy/") + technology.name).c_str(), copyFloor, technology)
            ->Unit(benchmark::kMillisecond);
    benchmark::RegisterBenchmark("print", printFloor)->Unit(benchmark::kMillisecond);
}

} // namespace orvex::bench
