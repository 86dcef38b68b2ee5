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

// The five technologies under the short names that benchmarks have.
struct Technology {
    const char* name;
    const char* identifier;
};
inline constexpr std::size_t kTechnologyCount = 5;
extern const Technology kTechnologies[kTechnologyCount];

// 20,000 messages of a technology: its capture, again and again. Read once.
const std::vector<Bytes>& recordedStream(const Technology& technology);
const std::vector<Bytes>& recordedStream(const char* name);
// The same without the extra packets, whose property lists are the telephony service's and take most of the
// time.
std::vector<Bytes> basebandStream(const Technology& technology);

// A generator with its real template.
std::unique_ptr<LogGenerator> makeGenerator(const char* identifier);

// The counter that the table reads: so many messages in each iteration.
void countMessages(benchmark::State& state, std::size_t messagesPerIteration);

// Each file of benchmarks enters its own, under the names by which the table knows them.
void registerFloors();
void registerDictionaries();
void registerDecoding();
void registerRebuilding();
void registerPainting();
void registerStarting();
void registerPorts();
// Decodes captures that it writes into the directory: one of so many MiB, and smaller ones.
void registerOffline(const std::string& directory, std::size_t captureMiB);

// The sender of the port benchmark, a process of its own: orvex_bench --send DIRECTORY PORT COUNT
// MICROSECONDS sends so many messages, one after another or with a pause before each.
inline constexpr const char* kPortSender = "--send";
int sendToPort(int argc, char** argv);

} // namespace orvex::bench
