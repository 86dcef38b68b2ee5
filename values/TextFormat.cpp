#include "TextFormat.h"

#include "FixedPoint.h"

#include <array>
#include <charconv>
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

// By the C library, which knows all that a conversion can ask for.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral" // PrintfFormat has seen to it
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

// Behind the letter of the conversion that starts at the '%'.
const char* endOfConversion(const char* percent)
{
    constexpr std::string_view kBeforeLetter = "-+ #0123456789.lz";
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

// Most of what Orvex prints is plain: the library takes ten times as long to read the format again.
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
    case Kind::real: return appendFixedPoint(text, conversion, _content.real);
    case Kind::text:
        if (conversion != "%s")
            return false;
        text += _content.text ? _content.text : "(null)";
        return true;
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
    case Kind::real: return appendByLibrary(text, conversion, _content.real);
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
