// How fast recorded streams are decoded while nobody reads the system log.

#include "Benchmarks.h"
#include "DecodeLoop.h"

#include "SystemLog.h"

#include <string_view>

namespace orvex::bench {
namespace {

constexpr std::size_t kMessagesPerRefresh = 4'000; // two seconds of a busy modem

// A log that nobody reads.
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

} // namespace

void registerDecoding()
{
    for (const Technology& technology : kTechnologies) {
        registerDecode("decode", technology, decode);
        if (technology.name != std::string_view("ifx")) // it has no packets, only property lists
            registerDecode("baseband", technology, decodeBaseband);
    }
}

} // namespace orvex::bench
