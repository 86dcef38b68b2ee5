#pragma once

#include <concepts>
#include <type_traits>
#include <utility>

namespace orvex {

// The type an argument is promoted to when passed to printf.
template <typename T>
using PrintfArgument = std::conditional_t<std::integral<T>, decltype(+std::declval<T>()),
    std::conditional_t<std::floating_point<T>, double,
        std::conditional_t<std::same_as<T, char*>, const char*, T>>>;

// A printf format checked against its argument types at compile time: %d %i %c %u %x %X take a signed or
// unsigned int, with "l" or "z" one of the width of a long; %f %e %g take a double, %s a text, %p a const
// void*. Anything else does not compile.
template <typename... Arguments>
class PrintfFormat {
public:
    consteval PrintfFormat(const char* text) // NOLINT(google-explicit-constructor): as std::format_string
        : _text(text)
    {
        const char* place = text;
        (requireConversion<PrintfArgument<Arguments>>(place), ...);
        if (nextConversion(place))
            throw "the format asks for more than there is";
    }

    const char* text() const { return _text; }

private:
    static constexpr bool isOneOf(char character, const char* characters)
    {
        for (; *characters; ++characters) {
            if (character == *characters)
                return true;
        }
        return false;
    }

    // Moves past the flags, width and precision of the next conversion. False if there is none.
    static constexpr bool nextConversion(const char*& place)
    {
        for (; *place; ++place) {
            if (*place != '%')
                continue;
            ++place;
            if (*place == '%')
                continue;
            while (isOneOf(*place, "-+ 0123456789."))
                ++place;
            return true;
        }
        return false;
    }

    template <typename T>
    static constexpr void requireConversion(const char*& place)
    {
        if (!nextConversion(place))
            throw "the format asks for less than there is";
        const bool isLong = *place == 'l' || *place == 'z';
        if (isLong)
            ++place;
        const char* fitting = "";
        if constexpr (std::integral<T>)
            fitting = isLong == (sizeof(T) == sizeof(long)) ? "dicuxX" : "";
        else if constexpr (std::floating_point<T>)
            fitting = "feg"; // "l" makes no difference
        else if constexpr (std::same_as<T, const char*>)
            fitting = isLong ? "" : "s";
        else if constexpr (std::same_as<T, const void*>)
            fitting = isLong ? "" : "p";
        if (!isOneOf(*place, fitting))
            throw "the format does not fit the argument";
        ++place;
    }

    const char* _text;
};

} // namespace orvex
