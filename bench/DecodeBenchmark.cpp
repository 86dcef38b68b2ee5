// Measures how fast recorded streams are decoded, with the system log off and on. A log gets a line for every
// section and packet, through the file writer of orvex-decode --log or through the application's queue. Both
// write to /dev/null, so that no disk is measured.

#include "Benchmarks.h"

#include "LinuxSystemLog.h"

#include <benchmark/benchmark.h>

#include <atomic>
#include <cstdio>
#include <limits>
#include <string_view>

namespace orvex::bench {
namespace {

constexpr std::size_t kMessagesPerRefresh = 4'000; // two seconds of a busy modem
constexpr std::size_t kOnceAtTheEnd = std::numeric_limits<std::size_t>::max();
constexpr const char* kNowhere = "/dev/null";

// Decodes the messages in every iteration, with this system log. Asks for the display, which releases the raw
// packets, after a number of messages or once at the end.
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

// A log without a reader.
class DroppingLog final : public SystemLog {
public:
    void write(Priority, std::string_view) override { }
    bool wants(Priority) const override { return false; }
};

void decode(benchmark::State& state, const Technology& technology)
{
    DroppingLog log;
    decodeInto(log, state, technology, recordedStream(technology), kMessagesPerRefresh);
}

void decodeBaseband(benchmark::State& state, const Technology& technology)
{
    DroppingLog log;
    decodeInto(log, state, technology, basebandStream(technology), kMessagesPerRefresh);
}

// A queue that discards its lines and counts those it was given and those it wrote.
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
    // Percentage of lines kept.
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

void decodeIntoFile(benchmark::State& state, const Technology& technology)
{
    FileSystemLog log(kNowhere);
    decodeInto(log, state, technology, recordedStream(technology), kOnceAtTheEnd);
}

// The queue drops lines if its thread cannot keep up.
void decodeIntoQueue(benchmark::State& state, const Technology& technology)
{
    CountedQueue log;
    decodeInto(log, state, technology, recordedStream(technology), kOnceAtTheEnd);
    state.counters["kept %"] = log.keptPercent();
}

void decodeBasebandIntoFile(benchmark::State& state, const Technology& technology)
{
    FileSystemLog log(kNowhere);
    decodeInto(log, state, technology, basebandStream(technology), kOnceAtTheEnd);
}

// Registers a benchmark as "KIND/TECHNOLOGY".
void registerDecode(const std::string& kind, const Technology& technology,
    void (*decode)(benchmark::State& state, const Technology& technology))
{
    benchmark::RegisterBenchmark((kind + '/' + technology.name).c_str(), decode, technology)
        ->Unit(benchmark::kMillisecond);
}

} // namespace

void registerDecoding()
{
    for (const Technology& technology : kTechnologies) {
        registerDecode("decode", technology, decode);
        registerDecode("decode+file", technology, decodeIntoFile);
        registerDecode("decode+queue", technology, decodeIntoQueue);
        if (technology.name == std::string_view("ifx")) // property lists only
            continue;
        registerDecode("baseband", technology, decodeBaseband);
        registerDecode("baseband+file", technology, decodeBasebandIntoFile);
    }
}

} // namespace orvex::bench
