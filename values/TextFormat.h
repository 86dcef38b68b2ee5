#pragma once

#include "PrintfFormat.h"

#include <concepts>
#include <cstdint>
#include <string>

namespace orvex {

// A printf argument of any type.
class PrintfValue {
public:
    // T is a PrintfArgument.
    template <typename T>
    explicit PrintfValue(T argument)
    {
        if constexpr (std::integral<T>) {
            _kind = sizeof(T) == sizeof(std::int64_t) ? Kind::longNumber : Kind::number;
            _content.bits = static_cast<std::uint64_t>(argument);
        } else if constexpr (std::floating_point<T>) {
            _kind = Kind::real;
            _content.real = argument;
        } else if constexpr (std::same_as<T, const char*>) {
            _kind = Kind::text;
            _content.text = argument;
        } else {
            _kind = Kind::pointer;
            _content.pointer = argument;
        }
    }

    // Appends the formatted value. The conversion runs from '%' to its letter.
    void appendTo(std::string& text, std::string_view conversion) const;

private:
    enum class Kind : std::uint8_t { number, longNumber, real, text, pointer };

    bool appendPlainly(std::string& text, std::string_view conversion) const;
    std::int64_t withSign() const;
    std::uint64_t withoutSign() const;

    Kind _kind;
    union {
        std::uint64_t bits;
        double real;
        const char* text;
        const void* pointer;
    } _content;
};

// Appends the formatted text. The format must match the arguments.
void appendPrinted(std::string& text, const char* format, const PrintfValue* arguments);

// The same, checked at compile time.
template <typename... Arguments>
void appendText(
    std::string& text, PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
{
    const PrintfValue values[] = {
        PrintfValue(static_cast<PrintfArgument<Arguments>>(arguments))..., PrintfValue(0)};
    appendPrinted(text, format.text(), values);
}

// A formatted text of any length.
template <typename... Arguments>
std::string text(PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
{
    std::string result;
    appendText(result, format, arguments...);
    return result;
}

} // namespace orvex
