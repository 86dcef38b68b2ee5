// Fills a dictionary with 100,000 keys and looks each up: random keys, and keys chosen to collide under
// std::hash.

#include "Benchmarks.h"

#include "Dictionary.h"

#include <benchmark/benchmark.h>

#include <cstring>
#include <functional>
#include <random>

namespace orvex::bench {
namespace {

constexpr std::size_t kKeyCount = 100'000;
using Keys = std::vector<std::string>;

std::string keyOf(std::uint64_t first, std::uint64_t second)
{
    std::string key(16, '\0');
    std::memcpy(key.data(), &first, 8);
    std::memcpy(key.data() + 8, &second, 8);
    return key;
}

Keys randomKeys()
{
    std::mt19937_64 random(1);
    Keys keys(kKeyCount);
    for (std::string& key : keys)
        key = keyOf(random(), random());
    return keys;
}

// libstdc++ hashes 8 bytes at a time in reversible steps, so the second half of a key can undo the first.
Keys chosenKeys()
{
    constexpr std::uint64_t kFactor = 0xC6A4A7935BD1E995;
    std::uint64_t inverse = kFactor; // modulo 2^64, by Newton's method
    for (int i = 0; i < 6; ++i)
        inverse *= 2 - kFactor * inverse;
    const auto mixed = [](std::uint64_t word) {
        word *= kFactor;
        return (word ^ word >> 47) * kFactor;
    };
    const auto unmixed = [inverse](std::uint64_t word) {
        word *= inverse;
        return (word ^ word >> 47) * inverse;
    };
    constexpr std::uint64_t kSeed = 0xC70F6907;
    Keys keys(kKeyCount);
    for (std::size_t i = 0; i < kKeyCount; ++i) {
        const std::uint64_t afterFirst = (kSeed ^ 16 * kFactor ^ mixed(i)) * kFactor;
        keys[i] = keyOf(i, unmixed(afterFirst));
    }
    return keys;
}

void fillAndFind(benchmark::State& state, Keys (*makeKeys)())
{
    const Keys keys = makeKeys();
    for (auto _ : state) {
        Dictionary dictionary;
        for (std::size_t i = 0; i < keys.size(); ++i)
            dictionary.set(keys[i], i);
        for (const std::string& key : keys)
            benchmark::DoNotOptimize(dictionary[key]);
    }
}

void fillAndFindChosen(benchmark::State& state)
{
    const Keys keys = chosenKeys();
    const std::hash<std::string_view> hash;
    if (hash(keys.front()) != hash(keys.back()))
        return state.SkipWithError("std::hash is another one here");
    fillAndFind(state, chosenKeys);
}

} // namespace

void registerDictionaries()
{
    benchmark::RegisterBenchmark("dictionary/random", fillAndFind, randomKeys)->Unit(benchmark::kMillisecond);
    benchmark::RegisterBenchmark("dictionary/chosen", fillAndFindChosen)->Unit(benchmark::kMillisecond);
}

} // namespace orvex::bench
