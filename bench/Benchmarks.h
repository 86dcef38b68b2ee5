#pragma once

#include "LogGenerator.h"

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

namespace benchmark {
class State;
}

namespace orvex::bench {

// The five technologies under their short names in benchmarks.
struct Technology {
    const char* name;
    const char* identifier;
};
inline constexpr std::size_t kTechnologyCount = 5;
extern const Technology kTechnologies[kTechnologyCount];

// 20,000 messages of a technology: its capture, repeated. Read once.
const std::vector<Bytes>& recordedStream(const Technology& technology);
const std::vector<Bytes>& recordedStream(const char* name);
// The same without extra packets, whose property lists come from the telephony service and take most of the
// time.
std::vector<Bytes> basebandStream(const Technology& technology);

// A generator with its real template.
std::unique_ptr<LogGenerator> makeGenerator(
    const char* identifier, std::size_t rawPacketLimit = RawPackets::kLimit);

// Sets the counter that the table reads: messages per iteration.
void countMessages(benchmark::State& state, std::size_t messagesPerIteration);

// Each file registers its benchmarks under the names that the table looks up.
void registerFloors();
void registerDictionaries();
void registerDecoding();
void registerRebuilding();
void registerPainting();
void registerStarting();
void registerPorts();
void registerTimelines();
// Decodes captures that it writes into the directory: one of the given size and smaller ones.
void registerOffline(const std::string& directory, std::size_t captureMiB);

// The sender of the port benchmark, run as a process of its own: orvex_bench --send DIRECTORY PORT COUNT
// MICROSECONDS sends COUNT messages, with a pause before each unless MICROSECONDS is 0.
inline constexpr const char* kPortSender = "--send";
int sendToPort(int argc, char** argv);

} // namespace orvex::bench
