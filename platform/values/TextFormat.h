#pragma once

#include <cstdarg>
#include <string>

namespace orvex {

// A text made by a printf format. Texts of any length come out whole.
[[gnu::format(printf, 1, 2)]] std::string text(const char* format, ...);

// The same into a string that already has its storage.
[[gnu::format(printf, 2, 0)]] void formatInto(
    std::string& result, const char* format, std::va_list arguments);

} // namespace orvex
