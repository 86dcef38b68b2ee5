#include "TextFormat.h"

#include <array>
#include <charconv>
#include <cmath>
#include <cstdio>

namespace orvex {

namespace {
template <typename Number>
void appendDigits(std::string& text, Number number)
{
    std::array<char, 24> digits; // NOLINT(cppcoreguidelines-pro-type-member-init): filled by to_chars
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr;
    text.append(digits.data(), end);
}

// A floating-point conversion, from '%' to its letter.
class RealConversion {
public:
    explicit RealConversion(std::string_view conversion)
        : _letter(conversion.back())
    {
        conversion.remove_prefix(1);
        for (; !conversion.empty(); conversion.remove_prefix(1)) {
            switch (conversion.front()) {
            case '-': _isLeft = true; continue;
            case '0': _hasZeros = true; continue;
            case '+': _plus = "+"; continue;
            case ' ': _plus = _plus.empty() ? " " : _plus; continue;
            default: break;
            }
            break;
        }
        const char* const end = conversion.data() + conversion.size();
        const char* const point = std::from_chars(conversion.data(), end, _width).ptr;
        if (*point == '.') {
            _precision = 0;
            std::from_chars(point + 1, end, _precision);
        }
    }

    // Formats as printf does in the C locale.
    void append(std::string& text, double number) const
    {
        const std::string_view sign = std::signbit(number) ? "-" : _plus;
        std::array<char, 352> buffer; // NOLINT(cppcoreguidelines-pro-type-member-init): filled by to_chars
        std::string longer;
        char* digits = buffer.data();
        std::size_t size = buffer.size();
        constexpr std::size_t kMostWholeDigits = 310;
        if (_precision > size - kMostWholeDigits) {
            longer.resize(_precision + kMostWholeDigits);
            digits = longer.data();
            size = longer.size();
        }
        char* const end =
            std::to_chars(digits, digits + size, std::fabs(number), format(), static_cast<int>(_precision))
                .ptr;
        const std::size_t length = sign.size() + static_cast<std::size_t>(end - digits);
        const std::size_t padding = _width > length ? _width - length : 0;
        const bool hasZeros = _hasZeros && !_isLeft && std::isfinite(number);
        if (!hasZeros && !_isLeft)
            text.append(padding, ' ');
        text += sign;
        if (hasZeros)
            text.append(padding, '0');
        text.append(digits, end);
        if (_isLeft)
            text.append(padding, ' ');
    }

private:
    std::chars_format format() const
    {
        return _letter == 'f' ? std::chars_format::fixed
            : _letter == 'e'  ? std::chars_format::scientific
                              : std::chars_format::general;
    }

    char _letter;
    bool _isLeft = false;
    bool _hasZeros = false;
    std::string_view _plus;
    std::size_t _width = 0;
    std::size_t _precision = 6;
};

// Formats with the C library, which knows every other conversion.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral" // PrintfFormat has checked it
template <typename T>
void appendByLibrary(std::string& text, std::string_view conversion, T argument)
{
    const std::string format(conversion);
    const int length = std::snprintf(nullptr, 0, format.c_str(), argument);
    if (length <= 0)
        return;
    const std::size_t start = text.size();
    text.resize(start + static_cast<std::size_t>(length));
    std::snprintf(text.data() + start, static_cast<std::size_t>(length) + 1, format.c_str(), argument);
}
#pragma GCC diagnostic pop

// One past the letter of the conversion that starts at the '%'.
const char* endOfConversion(const char* percent)
{
    constexpr std::string_view kBeforeLetter = "-+ 0123456789.lz";
    const char* place = percent + 1;
    while (kBeforeLetter.find(*place) != std::string_view::npos)
        ++place;
    return place + 1;
}
} // namespace

std::int64_t PrintfValue::withSign() const
{
    return _kind == Kind::longNumber ? static_cast<std::int64_t>(_content.bits)
                                     : static_cast<std::int32_t>(_content.bits);
}

std::uint64_t PrintfValue::withoutSign() const
{
    return _kind == Kind::longNumber ? _content.bits : static_cast<std::uint32_t>(_content.bits);
}

// Most conversions are plain; letting the C library parse them again takes ten times as long.
bool PrintfValue::appendPlainly(std::string& text, std::string_view conversion) const
{
    switch (_kind) {
    case Kind::number:
    case Kind::longNumber:
        if (conversion == "%d" || conversion == "%ld")
            appendDigits(text, withSign());
        else if (conversion == "%u" || conversion == "%lu" || conversion == "%zu")
            appendDigits(text, withoutSign());
        else
            return false;
        return true;
    case Kind::text:
        if (conversion != "%s")
            return false;
        text += _content.text ? _content.text : "(null)";
        return true;
    case Kind::real:
    case Kind::pointer: break;
    }
    return false;
}

void PrintfValue::appendTo(std::string& text, std::string_view conversion) const
{
    if (appendPlainly(text, conversion))
        return;
    switch (_kind) {
    case Kind::number: return appendByLibrary(text, conversion, static_cast<std::int32_t>(_content.bits));
    case Kind::longNumber: return appendByLibrary(text, conversion, static_cast<long>(_content.bits));
    case Kind::real: return RealConversion(conversion).append(text, _content.real);
    case Kind::text: return appendByLibrary(text, conversion, _content.text);
    case Kind::pointer: return appendByLibrary(text, conversion, _content.pointer);
    }
}

void appendPrinted(std::string& text, const char* format, const PrintfValue* arguments)
{
    const char* place = format;
    for (;;) {
        const char* start = place;
        while (*place && *place != '%')
            ++place;
        text.append(start, place);
        if (!*place)
            return;
        if (place[1] == '%') {
            text += '%';
            place += 2;
            continue;
        }
        const char* end = endOfConversion(place);
        (arguments++)->appendTo(text, {place, end});
        place = end;
    }
}

} // namespace orvex
