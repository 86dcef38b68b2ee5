#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

// How far the clock of a capture may go back before it counts as set back: a modem reports some messages
// late.
inline constexpr std::chrono::seconds kMessageDisorder{1};

// How the display is to be followed.
struct Sampling {
    // Sets the members from the values of --every and --field. Returns what is wrong with them; empty for
    // nothing.
    std::string read(const std::optional<std::string>& seconds, const std::vector<std::string>& paths);

    std::chrono::milliseconds every{2000}; // as often as a session shows the display
    std::vector<std::string> fields;       // as of TimelineFields; empty for everything
};

} // namespace orvex
