#include "Sampling.h"

#include <charconv>
#include <cmath>

namespace orvex {

std::string Sampling::read(const std::optional<std::string>& seconds, const std::vector<std::string>& paths)
{
    constexpr double kLeast = 0.1;
    constexpr double kMost = 86'400;
    if (seconds) {
        double number = 0;
        const char* const last = seconds->data() + seconds->size();
        const auto [end, error] = std::from_chars(seconds->data(), last, number, std::chars_format::fixed);
        if (error != std::errc() || end != last || !(number >= kLeast && number <= kMost))
            return "--every takes seconds, from 0.1 to 86400.";
        every = std::chrono::milliseconds(std::llround(number * 1000));
    }
    for (const std::string& path : paths) {
        if (!path.starts_with('/'))
            return "--field takes a path that begins with '/'.";
    }
    fields = paths;
    return {};
}

} // namespace orvex
