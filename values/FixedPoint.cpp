#include "FixedPoint.h"

#include <array>
#include <cmath>
#include <cstdint>
#include <optional>

namespace orvex {

namespace {
struct Form {
    std::size_t width = 0;
    std::size_t decimals = 6;
};

std::size_t takeDigit(std::string_view& text, std::size_t otherwise)
{
    if (text.empty() || text.front() < '0' || text.front() > '9')
        return otherwise;
    const auto digit = static_cast<std::size_t>(text.front() - '0');
    text.remove_prefix(1);
    return digit;
}

// Of "%f", "%4f", "%.2f", "%4.2lf": no flags, and one digit each.
std::optional<Form> formOf(std::string_view conversion)
{
    conversion.remove_prefix(1);
    if (conversion.starts_with('0'))
        return std::nullopt; // a flag
    Form form;
    form.width = takeDigit(conversion, form.width);
    if (conversion.starts_with('.')) {
        conversion.remove_prefix(1);
        form.decimals = takeDigit(conversion, 0);
    }
    constexpr std::size_t kMostDecimals = 6;
    if ((conversion != "f" && conversion != "lf") || form.decimals > kMostDecimals)
        return std::nullopt;
    return form;
}
} // namespace

bool appendFixedPoint(std::string& text, std::string_view conversion, double number)
{
    constexpr std::uint64_t kPowers[] = {1, 10, 100, 1'000, 10'000, 100'000, 1'000'000};
    constexpr int kFractionBits = 16;
    constexpr std::uint64_t kFraction = std::uint64_t{1} << kFractionBits;
    constexpr double kTooLarge = 1 << 26; // times 2^16 and 10^6 it still fits into 64 bits

    const auto form = formOf(conversion);
    const double magnitude = std::fabs(number);
    if (!form || !(magnitude < kTooLarge))
        return false;
    const double steps = magnitude * kFraction; // exact: a power of two
    const auto count = static_cast<std::uint64_t>(steps);
    if (static_cast<double>(count) != steps)
        return false;

    const std::uint64_t power = kPowers[form->decimals];
    const std::uint64_t product = count * power;
    const std::uint64_t rest = product % kFraction;
    std::uint64_t rounded = product / kFraction;
    if (rest > kFraction / 2 || (rest == kFraction / 2 && rounded % 2 != 0))
        ++rounded;

    // From the right: decimals, point, whole digits, sign, and spaces up to the width.
    std::array<char, 24> buffer; // NOLINT(cppcoreguidelines-pro-type-member-init): filled from its end
    char* const end = buffer.data() + buffer.size();
    char* place = end;
    const auto putDigit = [&] {
        *--place = static_cast<char>('0' + rounded % 10);
        rounded /= 10;
    };
    for (std::size_t i = 0; i < form->decimals; ++i)
        putDigit();
    if (form->decimals > 0)
        *--place = '.';
    do
        putDigit();
    while (rounded > 0);
    if (std::signbit(number))
        *--place = '-';
    while (static_cast<std::size_t>(end - place) < form->width)
        *--place = ' ';
    text.append(place, end);
    return true;
}

} // namespace orvex
