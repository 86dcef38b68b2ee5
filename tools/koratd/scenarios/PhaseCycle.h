#pragma once

#include "Randomness.h"

#include <cstddef>
#include <vector>

namespace orvex::korat {

// What a handset goes through: phases of random length, one after the other, and then again from one of them
// on.
class PhaseCycle {
public:
    struct Duration {
        int shortest = 0; // s
        int longest = 0;
    };

    // Of a table of phases, each with a duration.
    template <typename Phases>
    static std::vector<Duration> durationsOf(const Phases& phases)
    {
        std::vector<Duration> result;
        for (const auto& phase : phases)
            result.push_back(phase.duration);
        return result;
    }

    PhaseCycle(std::vector<Duration> phases, std::size_t again)
        : _phases(std::move(phases))
        , _again(again)
    {
    }

    // Called in every step, with the scenario's time; true when a phase begins. While the handset is held
    // back, the first phase goes on, or begins anew.
    bool step(double seconds, bool isHeldBack, Randomness& randomness);

    std::size_t current() const { return _current; }
    double secondsIn(double seconds) const { return seconds - _begin; }

private:
    void begin(std::size_t phase, double seconds, Randomness& randomness);

    std::vector<Duration> _phases;
    std::size_t _again;
    std::size_t _current = 0;
    double _begin = 0; // s
    double _end = 0;
};

} // namespace orvex::korat
