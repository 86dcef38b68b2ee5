#pragma once

#include <stdexcept>
#include <string>

namespace orvex::soak {

// A check that failed: what was expected, and what was seen in its place.
class Disappointment : public std::runtime_error {
public:
    Disappointment(const std::string& expected, const std::string& seen)
        : std::runtime_error("expected: " + expected + "\n    seen: " + seen)
    {
    }
};

inline void expect(bool holds, const std::string& expected, const std::string& seen)
{
    if (!holds)
        throw Disappointment(expected, seen);
}

} // namespace orvex::soak
