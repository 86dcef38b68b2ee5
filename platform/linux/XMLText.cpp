#include "XMLText.h"

#include <algorithm>
#include <cstdint>

namespace orvex {

namespace {
constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

bool isPlain(char character)
{
    return (character >= ' ' && character <= '~') || character == '\n';
}

// The length of the character that the text starts with; 0 when XML cannot hold it. The text is not empty.
std::size_t lengthOfFirst(std::string_view text)
{
    const auto byte = [text](std::size_t i) { return static_cast<std::uint8_t>(text[i]); };
    const std::uint32_t first = byte(0);
    if (first < 0x80)
        return first >= 0x20 || first == '\t' || first == '\n' || first == '\r' ? 1 : 0;
    const std::size_t length = first >= 0xF0 ? 4 : first >= 0xE0 ? 3 : 2;
    if (first < 0xC0 || first > 0xF7 || text.size() < length)
        return 0;
    std::uint32_t character = first & (0x7FU >> length);
    for (std::size_t i = 1; i < length; ++i) {
        if ((byte(i) & 0xC0U) != 0x80)
            return 0;
        character = character << 6 | (byte(i) & 0x3FU);
    }
    constexpr std::uint32_t kSmallest[] = {0, 0, 0x80, 0x800, 0x10000}; // smaller ones have a shorter form
    const bool isSurrogate = character >= 0xD800 && character <= 0xDFFF;
    const bool isGood = character >= kSmallest[length] && character <= 0x10FFFF && !isSurrogate
        && character != 0xFFFE && character != 0xFFFF;
    return isGood ? length : 0;
}
} // namespace

std::string xmlText(std::string_view text)
{
    if (std::all_of(text.begin(), text.end(), isPlain))
        return std::string(text);
    std::string result;
    result.reserve(text.size());
    while (!text.empty()) {
        const std::size_t length = lengthOfFirst(text);
        result += length ? text.substr(0, length) : kReplacement;
        text.remove_prefix(std::max<std::size_t>(length, 1));
    }
    return result;
}

} // namespace orvex
