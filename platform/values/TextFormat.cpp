#include "TextFormat.h"

#include <array>
#include <cstdio>

namespace orvex {

std::string text(const char* format, ...)
{
    std::string result;
    std::va_list arguments; // NOLINT(cppcoreguidelines-init-variables): va_start initialises it
    va_start(arguments, format);
    formatInto(result, format, arguments);
    va_end(arguments);
    return result;
}

void formatInto(std::string& result, const char* format, std::va_list arguments)
{
    std::va_list again; // NOLINT(cppcoreguidelines-init-variables): va_copy initialises it
    va_copy(again, arguments);
    std::array<char, 128> buffer; // NOLINT(cppcoreguidelines-pro-type-member-init): filled by vsnprintf
    // NOLINTNEXTLINE(clang-analyzer-valist.Uninitialized): the caller started it
    const int length = std::vsnprintf(buffer.data(), buffer.size(), format, arguments);
    if (length < 0) {
        result.clear(); // an encoding error of the C library: nothing sensible was written
    } else if (static_cast<std::size_t>(length) < buffer.size()) {
        result.assign(buffer.data(), static_cast<std::size_t>(length));
    } else {
        result.resize(static_cast<std::size_t>(length));
        std::vsnprintf(result.data(), result.size() + 1, format, again);
    }
    va_end(again);
}

} // namespace orvex
