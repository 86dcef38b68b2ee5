// Measures what following the display over time adds to decoding: ten hours of a capture, repeated with
// running times, sampled every two seconds into an output that drops everything.

#include "Benchmarks.h"

#include "CaptureReader.h"
#include "CaptureSampler.h"

#include <benchmark/benchmark.h>

#include <chrono>
#include <string>
#include <vector>

namespace orvex::bench {
namespace {

using std::chrono::microseconds;

constexpr std::chrono::hours kLength{10};

struct TimedMessage {
    Bytes bytes;
    microseconds time;
};

std::vector<TimedMessage> timedCapture(const Technology& technology)
{
    const auto reader =
        CaptureReader::open(std::string(ORVEX_CAPTURES) + '/' + technology.identifier + ".pcap");
    std::vector<TimedMessage> messages;
    while (reader->next() == CaptureReader::Status::message)
        messages.push_back({Bytes(reader->message().begin(), reader->message().end()), reader->time()});
    return messages;
}

class DroppingOutput final : public TimelineOutput {
public:
    void begin(const DecodedCapture&) override { }
    std::string end(const DecodedCapture&) override { return {}; }
    void sample(Date) override { }
    void addRow(std::size_t, const TimelineRow&) override { }
    void set(std::size_t, const std::string&) override { ++_changes; }
    void clear(std::size_t) override { ++_changes; }

    std::size_t changes() const { return _changes; }

private:
    std::size_t _changes = 0;
};

// Gives the messages to the session, and before that to the sampler if there is one. Returns their number.
std::size_t decode(
    const std::vector<TimedMessage>& messages, OfflineSession& session, CaptureSampler* sampler)
{
    const microseconds step = messages.back().time - messages.front().time + std::chrono::seconds(1);
    std::size_t count = 0;
    for (microseconds shift{}; shift < kLength; shift += step) {
        for (const auto& [bytes, time] : messages) {
            if (sampler)
                sampler->take(bytes, time + shift);
            session.take(bytes);
        }
        count += messages.size();
    }
    return count;
}

void decodeHours(benchmark::State& state, const Technology& technology, bool isSampled)
{
    const auto messages = timedCapture(technology);
    std::size_t count = 0;
    DroppingOutput output;
    for (auto _ : state) {
        OfflineSession session(makeGenerator(technology.identifier, 0), 0);
        if (isSampled) {
            CaptureSampler sampler({}, session, output);
            count = decode(messages, session, &sampler);
            sampler.finish();
        } else {
            count = decode(messages, session, nullptr);
            benchmark::DoNotOptimize(session.display());
        }
    }
    countMessages(state, count);
    state.counters["changes"] = static_cast<double>(output.changes());
}

} // namespace

void registerTimelines()
{
    for (const Technology& technology : kTechnologies) {
        for (const auto& [kind, isSampled] : {std::pair("hours/", false), {"hours+timeline/", true}})
            benchmark::RegisterBenchmark(
                (std::string(kind) + technology.name).c_str(), decodeHours, technology, isSampled)
                ->Unit(benchmark::kMillisecond);
    }
}

} // namespace orvex::bench
