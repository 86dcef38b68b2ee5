#pragma once

#include <cstdint>
#include <random>

namespace orvex::korat {

// Random numbers that depend on the seed alone. (The distributions of the standard library differ from one
// library to the next.)
class Randomness {
public:
    explicit Randomness(std::uint64_t seed)
        : _engine(seed)
    {
    }

    // From 0 up to, and without, 1.
    double share();
    // From the first to the last, both included.
    int number(int first, int last);
    bool chance(double probability) { return share() < probability; }
    // Of mean 0 and deviation 1; never beyond 6.
    double normal();

private:
    std::mt19937_64 _engine;
};

} // namespace orvex::korat
