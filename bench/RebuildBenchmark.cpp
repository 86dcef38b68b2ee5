// Measures one rebuild of the display tree with its path dictionary: for the final display of each recorded
// stream, and for the fullest GSM and UMTS display, with 32 records in every list.

#include "Benchmarks.h"

#include "NodesByPath.h"

#include "Array.h"
#include "TelephonyConstants.h"

#include <benchmark/benchmark.h>

#include <map>

namespace orvex::bench {
namespace {

constexpr std::size_t kListLength = 32;

// The greatest length of each list of a display, by path.
using LongestLists = std::map<std::string, ArrayRef>;

void remember(LongestLists& longest, const std::string& path, const Value& shown)
{
    if (const auto list = shown.array()) {
        ArrayRef& known = longest[path];
        if (!known || known->size() < list->size())
            known = shown.deepCopy().array();
    } else if (const auto dictionary = shown.dictionary()) {
        for (const auto& [key, value] : *dictionary)
            remember(longest, pathByAppending(path, key), value);
    }
}

// Fills each list with copies of its records. A list without records stays empty.
void fill(const LongestLists& longest, const std::string& path, const Value& shown)
{
    if (const auto list = shown.array()) {
        const Array& records = *longest.at(path);
        list->removeAll();
        for (std::size_t i = 0; i < kListLength && !records.isEmpty(); ++i)
            list->append(records[i % records.size()].deepCopy());
    } else if (const auto dictionary = shown.dictionary()) {
        for (const auto& [key, value] : *dictionary)
            fill(longest, pathByAppending(path, key), value);
    }
}

std::size_t count(const OrvexModelNode& node)
{
    std::size_t result = 1;
    if (const auto* children = node.childNodes()) {
        for (const auto& child : *children)
            result += count(*child);
    }
    return result;
}

void rebuild(benchmark::State& state, const Value& display)
{
    std::size_t nodeCount = 0;
    for (auto _ : state) {
        NodesByPath nodes;
        benchmark::DoNotOptimize(OrvexModelNode::makeTreeFromObject(display, nodes));
        for (const char* path :
            {"/", "/Neighbors", "/Neighbors/Neighboring Cells"}) // the screens that are open
            benchmark::DoNotOptimize(nodes[path]);
        nodeCount = nodeCount ? nodeCount : count(*nodes["/"]);
    }
    state.counters["nodes"] = static_cast<double>(nodeCount);
}

void rebuildAfterStream(benchmark::State& state, const Technology& technology)
{
    const auto generator = makeGenerator(technology.identifier);
    Dictionary session;
    for (const Bytes& message : recordedStream(technology))
        generator->updateState(session, message);
    rebuild(state, generator->generateLogUsingState(session));
}

void rebuildFullest(benchmark::State& state)
{
    const auto generator = makeGenerator(telephony::kTechnologyMRL_GSM);
    Dictionary session;
    LongestLists longest;
    std::size_t count = 0;
    for (const Bytes& message : recordedStream("gsm")) {
        generator->updateState(session, message);
        if (++count % 16 == 0)
            remember(longest, "/", session["Display"]);
    }
    const Value display = generator->generateLogUsingState(session).deepCopy();
    fill(longest, "/", display);
    rebuild(state, display);
}

} // namespace

void registerRebuilding()
{
    for (const Technology& technology : kTechnologies)
        benchmark::RegisterBenchmark(
            (std::string("rebuild/") + technology.name).c_str(), rebuildAfterStream, technology)
            ->Unit(benchmark::kMicrosecond);
    benchmark::RegisterBenchmark("rebuild/fullest", rebuildFullest)->Unit(benchmark::kMicrosecond);
}

} // namespace orvex::bench
