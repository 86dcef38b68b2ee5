// How fast recorded streams are decoded, beside two floors: copying each payload, and printing eight integers
// a message into strings that have their storage.

#include "FileResources.h"
#include "LogGenerator.h"
#include "OrvexModelNode.h"
#include "SystemClock.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"
#include "scenarios/ScenarioTable.h"

#include "Console.h"

#include <benchmark/benchmark.h>

#include <array>
#include <cstring>
#include <map>

namespace orvex {
namespace {

constexpr std::size_t kMessageCount = 20'000;

std::vector<Bytes> recordedStream(const char* technology)
{
    const auto scenario = korat::findScenario(technology, "")->make({});
    std::vector<Bytes> messages;
    while (messages.size() < kMessageCount)
        messages.push_back(scenario->next().message.bytes);
    return messages;
}

const std::vector<Bytes>& stream(const char* technology)
{
    static std::map<std::string_view, std::vector<Bytes>> streams;
    const auto [stream, isNew] = streams.try_emplace(technology);
    if (isNew)
        stream->second = recordedStream(technology);
    return stream->second;
}

void countMessages(benchmark::State& state)
{
    state.counters["messages/s"] = benchmark::Counter(
        static_cast<double>(state.iterations()) * kMessageCount, benchmark::Counter::kIsRate);
}

void copyFloor(benchmark::State& state, const char* technology)
{
    Bytes buffer(1 << 16);
    const auto& messages = stream(technology);
    for (auto _ : state) {
        for (const Bytes& message : messages) {
            std::memcpy(buffer.data(), message.data(), std::min(message.size(), buffer.size()));
            benchmark::ClobberMemory();
        }
    }
    countMessages(state);
}

void printFloor(benchmark::State& state)
{
    std::array<std::string, 8> rows;
    int value = 0;
    for (auto _ : state) {
        for (std::size_t message = 0; message < kMessageCount; ++message) {
            for (std::string& row : rows) {
                std::array<char, 32> text{};
                const int length = std::snprintf(text.data(), text.size(), "%d", value++);
                row.assign(text.data(), static_cast<std::size_t>(length));
            }
            benchmark::DoNotOptimize(rows);
        }
    }
    countMessages(state);
}

std::unique_ptr<LogGenerator> makeGenerator(const char* technology)
{
    static const FileResources kResources(ORVEX_RESOURCES);
    static const SystemClock kClock;
    installConsole([](std::string_view) {});
    return LogGenerator::generatorFromTechnology(technology, {kResources, kClock, {}});
}

void decode(benchmark::State& state, const char* technology)
{
    const auto generator = makeGenerator(technology);
    Dictionary session;
    const auto& messages = stream(technology);
    for (auto _ : state) {
        for (const Bytes& message : messages)
            generator->updateState(session, message);
        generator->generateLogUsingState(session); // hands over the raw packets, as every refresh does
    }
    countMessages(state);
}

void rebuildTree(benchmark::State& state, const char* technology)
{
    const auto generator = makeGenerator(technology);
    Dictionary session;
    for (const Bytes& message : stream(technology))
        generator->updateState(session, message);
    const Value display = generator->generateLogUsingState(session);
    for (auto _ : state) {
        NodesByPath nodes;
        benchmark::DoNotOptimize(OrvexModelNode::makeTreeFromObject(display, nodes));
    }
}

BENCHMARK_CAPTURE(copyFloor, lte, telephony::kTechnologyMRL_LTE)->Unit(benchmark::kMillisecond);
BENCHMARK(printFloor)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(decode, lte, telephony::kTechnologyMRL_LTE)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(decode, utran, telephony::kTechnologyMRL_UTRAN2)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(decode, gsm, telephony::kTechnologyMRL_GSM)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(decode, cdma, telephony::kTechnologyMRL_CDMA)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(decode, ifx, telephony::kTechnologyIFX)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(rebuildTree, lte, telephony::kTechnologyMRL_LTE)->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(rebuildTree, utran, telephony::kTechnologyMRL_UTRAN2)->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(rebuildTree, gsm, telephony::kTechnologyMRL_GSM)->Unit(benchmark::kMicrosecond);

} // namespace
} // namespace orvex
