// Measures time and memory of orvex-decode as started from a shell.

#include "Benchmarks.h"
#include "ChildProcess.h"

#include "PcapWriter.h"

#include "TelephonyConstants.h"

#include <benchmark/benchmark.h>

#include <chrono>
#include <filesystem>

namespace orvex::bench {
namespace {

constexpr std::size_t kPcapRecordHeader = 16;
constexpr std::size_t kSmallMiB = 64;

std::string theDirectory; // for captures

// A capture of the given size: a stream, repeated. Deleted with the object.
class LargeCapture {
public:
    explicit LargeCapture(std::size_t miB, const std::vector<Bytes>& stream = recordedStream("lte"))
        : _path(theDirectory + "/bench-" + std::to_string(miB) + ".pcap")
    {
        PcapWriter file(_path);
        std::size_t bytes = 0;
        while (bytes < miB << 20) {
            for (const Bytes& message : stream) {
                file.write(message, std::chrono::microseconds(++_messageCount));
                bytes += message.size() + kPcapRecordHeader;
            }
        }
    }
    ~LargeCapture() { std::filesystem::remove(_path); }
    LargeCapture(const LargeCapture&) = delete;
    LargeCapture& operator=(const LargeCapture&) = delete;

    const std::string& path() const { return _path; }
    std::size_t messageCount() const { return _messageCount; }

private:
    std::string _path;
    std::size_t _messageCount = 0;
};

struct Run {
    double seconds;
    double peakMiB;
};

// Decodes a capture. No seconds if the program failed.
Run decode(const std::string& capture)
{
    const auto start = std::chrono::steady_clock::now();
    ChildProcess program({ORVEX_DECODE, "--technology", telephony::kTechnologyMRL_LTE, "--refresh-every",
        "1000", "--output", "/dev/null", capture});
    const auto end = program.waitForEnd();
    const double seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    return {end.isGood ? seconds : 0, static_cast<double>(end.peakKiB) / 1024};
}

void decodeCapture(benchmark::State& state, const LargeCapture& capture)
{
    for (auto _ : state) {
        const Run run = decode(capture.path());
        if (run.seconds == 0)
            return state.SkipWithError("orvex-decode failed");
        state.SetIterationTime(run.seconds);
        state.counters["messages/s"] = static_cast<double>(capture.messageCount()) / run.seconds;
        state.counters["peak MiB"] = run.peakMiB;
    }
}

void decodeStream(benchmark::State& state, std::size_t miB)
{
    decodeCapture(state, LargeCapture(miB));
}

void decodeBaseband(benchmark::State& state)
{
    decodeCapture(state, LargeCapture(kSmallMiB, basebandStream(kTechnologies[0])));
}

} // namespace

void registerOffline(const std::string& directory, std::size_t captureMiB)
{
    theDirectory = directory;
    for (const auto& [name, miB] : {std::pair("offline/small", kSmallMiB), {"offline/large", captureMiB}})
        benchmark::RegisterBenchmark(name, decodeStream, miB)
            ->Unit(benchmark::kSecond)
            ->UseManualTime()
            ->Iterations(1)
            ->Repetitions(1);
    benchmark::RegisterBenchmark("offline/baseband", decodeBaseband)
        ->Unit(benchmark::kSecond)
        ->UseManualTime()
        ->Iterations(1)
        ->Repetitions(1);
}

} // namespace orvex::bench
