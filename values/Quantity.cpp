#include "Quantity.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace orvex {

namespace {
constexpr std::string_view kUnits[] = {
    "%", "dB", "dBm", "bps", "kbps", "Mbps", "Hz", "kHz", "MHz", "GHz", "ms", "s", "sec"};

bool isDigit(char character)
{
    return character >= '0' && character <= '9';
}
} // namespace

std::optional<Quantity> quantityOf(std::string_view text)
{
    if (text.starts_with('+')) {
        text.remove_prefix(1);
        if (text.starts_with('-'))
            return std::nullopt;
    }
    // What from_chars takes besides: "inf" and "nan".
    const std::size_t digits = text.starts_with('-') ? 1 : 0;
    if (text.size() <= digits || !isDigit(text[digits]))
        return std::nullopt;
    double number = 0;
    const auto [end, error] =
        std::from_chars(text.data(), text.data() + text.size(), number, std::chars_format::fixed);
    if (error != std::errc() || !std::isfinite(number))
        return std::nullopt;
    std::string_view unit = text.substr(static_cast<std::size_t>(end - text.data()));
    if (unit.starts_with(' '))
        unit.remove_prefix(1);
    const auto* known = std::ranges::find(kUnits, unit);
    return known == std::end(kUnits) ? std::nullopt : std::optional(Quantity{number, *known});
}

} // namespace orvex
