#include "UTF8.h"

#include <cstdint>

namespace orvex {

void appendUTF8(std::string& text, char32_t character)
{
    const auto put = [&text](char32_t byte) { text += static_cast<char>(byte); };
    const auto putSixBits = [&](int position) { put(0x80 | (character >> position & 0x3F)); };
    if (character < 0x80) {
        put(character);
    } else if (character < 0x800) {
        put(0xC0 | character >> 6);
        putSixBits(0);
    } else if (character < 0x10000) {
        put(0xE0 | character >> 12);
        putSixBits(6);
        putSixBits(0);
    } else {
        put(0xF0 | character >> 18);
        putSixBits(12);
        putSixBits(6);
        putSixBits(0);
    }
}

UTF8Character firstOfUTF8(std::string_view text)
{
    const auto byte = [text](std::size_t i) { return static_cast<std::uint8_t>(text[i]); };
    if (text.empty())
        return {};
    const std::uint32_t first = byte(0);
    if (first < 0x80)
        return {first, 1};
    const std::size_t length = first >= 0xF0 ? 4 : first >= 0xE0 ? 3 : 2;
    if (first < 0xC0 || first > 0xF7 || text.size() < length)
        return {};
    char32_t character = first & (0x7FU >> length);
    for (std::size_t i = 1; i < length; ++i) {
        if ((byte(i) & 0xC0U) != 0x80)
            return {};
        character = character << 6 | (byte(i) & 0x3FU);
    }
    constexpr char32_t kSmallest[] = {0, 0, 0x80, 0x800, 0x10000}; // smaller ones have a shorter form
    const bool isSurrogate = character >= 0xD800 && character <= 0xDFFF;
    if (character < kSmallest[length] || character > 0x10FFFF || isSurrogate)
        return {};
    return {character, length};
}

} // namespace orvex
