#pragma once

#include <cstdint>

namespace orvex::korat {

// Random numbers that depend on the seed alone. (The distributions of the standard library differ from one
// library to the next, and its engines take most of the time when a scenario runs thousands of times as
// fast.)
class Randomness {
public:
    explicit Randomness(std::uint64_t seed)
        : _state(seed)
    {
    }

    // From 0 up to, and without, 1.
    double share();
    // From the first to the last, both included.
    int number(int first, int last);
    bool chance(double probability) { return share() < probability; }
    // Of mean 0 and deviation 1; never beyond 3.5.
    double normal();

private:
    std::uint64_t bits();

    std::uint64_t _state;
};

} // namespace orvex::korat
