#pragma once

#include "LogGenerator.h"

#include <memory>
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

// The first messages of a technology's drive through koratd's town, mixed as they come. Made once.
const std::vector<Bytes>& recordedStream(const Technology& technology);
const std::vector<Bytes>& recordedStream(const char* name);
// The same without the extra packets, whose property lists are the telephony service's and take most of the
// time.
std::vector<Bytes> basebandStream(const Technology& technology);

// A generator with its real template.
std::unique_ptr<LogGenerator> makeGenerator(const char* identifier);

// The counter that the table reads: so many messages in each iteration.
void countMessages(benchmark::State& state, std::size_t messagesPerIteration);

} // namespace orvex::bench
