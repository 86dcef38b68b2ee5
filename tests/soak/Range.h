#pragma once

#include <string>

namespace orvex::soak {

// A number of messages, as far as it can be known; both bounds included.
struct Range {
    long least = 0;
    long most = 0;

    bool contains(long number) const { return number >= least && number <= most; }
    std::string text() const
    {
        return least == most ? std::to_string(least) : std::to_string(least) + " to " + std::to_string(most);
    }

    Range& operator+=(const Range& other)
    {
        least += other.least;
        most += other.most;
        return *this;
    }
};

} // namespace orvex::soak
