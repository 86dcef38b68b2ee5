#pragma once

#include "DeferredText.h"

#include <span>

namespace orvex {

// One value of an enumerated field and the text that shows it.
struct EnumText {
    int value;
    const char* text;
};

// The text of a value, or the fallback when the table does not name it.
constexpr const char* textFor(int value, std::span<const EnumText> table, const char* fallback)
{
    for (const EnumText& entry : table) {
        if (entry.value == value)
            return entry.text;
    }
    return fallback;
}

// The same with a fallback that names the number.
inline DeferredText textOrNumberFor(int value, std::span<const EnumText> table, PrintfFormat<int> fallback)
{
    const char* name = textFor(value, table, nullptr);
    return name ? DeferredText(name) : DeferredText(fallback, value);
}

} // namespace orvex
