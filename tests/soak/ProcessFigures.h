#pragma once

#include <string>
#include <vector>

namespace orvex::soak {

// What a process holds.
struct ProcessFigures {
    double descriptors = 0;
    double megabytes = 0; // resident
    double threads = 0;

    static ProcessFigures of(long process);
    std::string text() const;
};

// Expects that the figures level off: that over the last third of the samples the median of none is more
// than its margin above that over the first third.
void expectLevel(const std::vector<ProcessFigures>& samples, const ProcessFigures& margins);

// "31 to 31 descriptors (at most 31), ..."
std::string summaryOf(const std::vector<ProcessFigures>& samples);

} // namespace orvex::soak
