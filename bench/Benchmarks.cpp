#include "Benchmarks.h"

#include "Captures.h"
#include "FileStorage.h"
#include "MessageFrame.h"
#include "QtRunLoop.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <iterator>
#include <map>
#include <string_view>

namespace orvex::bench {

namespace {
constexpr std::size_t kMessageCount = 20'000;
} // namespace

const Technology kTechnologies[kTechnologyCount] = {
    {"lte", telephony::kTechnologyMRL_LTE},
    {"utran", telephony::kTechnologyMRL_UTRAN2},
    {"gsm", telephony::kTechnologyMRL_GSM},
    {"cdma", telephony::kTechnologyMRL_CDMA},
    {"ifx", telephony::kTechnologyIFX},
};

const std::vector<Bytes>& recordedStream(const Technology& technology)
{
    static std::map<std::string_view, std::vector<Bytes>> streams;
    const auto [stream, isNew] = streams.try_emplace(technology.identifier);
    if (isNew) {
        const std::vector<Bytes> capture = test::captureOf(technology.identifier);
        while (stream->second.size() < kMessageCount)
            stream->second.push_back(capture[stream->second.size() % capture.size()]);
    }
    return stream->second;
}

const std::vector<Bytes>& recordedStream(const char* name)
{
    return recordedStream(*std::ranges::find(kTechnologies, std::string_view(name), &Technology::name));
}

std::vector<Bytes> basebandStream(const Technology& technology)
{
    std::vector<Bytes> result;
    std::ranges::copy_if(recordedStream(technology), std::back_inserter(result),
        [](const Bytes& message) { return MessageFrame(message).logType() == MessageFrame::kTypeBaseband; });
    return result;
}

std::unique_ptr<LogGenerator> makeGenerator(const char* identifier, std::size_t rawPacketLimit)
{
    static const FileResources kResources(ORVEX_RESOURCES);
    static const SystemClock kClock;
    return LogGenerator::generatorFromTechnology(identifier, {kResources, kClock, {}, rawPacketLimit});
}

void countMessages(benchmark::State& state, std::size_t messagesPerIteration)
{
    const auto count = static_cast<double>(state.iterations()) * static_cast<double>(messagesPerIteration);
    state.counters["messages/s"] = benchmark::Counter(count, benchmark::Counter::kIsRate);
}

} // namespace orvex::bench
