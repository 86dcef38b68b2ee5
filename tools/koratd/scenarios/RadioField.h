#pragma once

#include "Randomness.h"

#include <cstddef>
#include <vector>

namespace orvex::korat {

// The levels that a handset receives on its way along a road: loss by distance, and shadowing that wanders.
class RadioField {
public:
    struct Transmitter {
        double position = 0;     // along the road, m
        double offset = 20;      // beside the road, m
        double levelAt20m = -55; // dBm
        double slope = 35;       // dB per decade of distance
        int direction = 0;       // of its beam: 1 ahead, -1 back along the road, 0 all around
        bool isUnderground = false;
    };

    // Where only underground transmitters are heard.
    struct Underpass {
        double from = 0; // m
        double to = 0;
    };

    RadioField(std::vector<Transmitter> transmitters, Underpass underpass, double weakest, double strongest);

    // Moves the handset; called ten times a second.
    void step(double position, Randomness& randomness);

    std::size_t size() const { return _transmitters.size(); }
    // dBm, between the weakest and the strongest that the receiver can tell.
    double level(std::size_t transmitter) const { return _levels[transmitter]; }
    // The same, averaged over about a second.
    double average(std::size_t transmitter) const { return _averages[transmitter]; }

private:
    double loss(const Transmitter& transmitter, double position) const;

    std::vector<Transmitter> _transmitters;
    Underpass _underpass;
    double _weakest;
    double _strongest;
    std::vector<double> _losses; // by distance, dB
    std::size_t _turn = 0;       // whose losses are computed next
    std::vector<double> _shadowing;
    std::vector<double> _levels;
    std::vector<double> _averages;
};

} // namespace orvex::korat
