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
    constexpr char32_t kSmallest[] = {0, 0, 0x80, 0x800, 0x10000}; // below: overlong
    if (character < kSmallest[length] || !isUnicodeCharacter(character))
        return {};
    return {character, length};
}

std::string utf8FromUTF16(std::u16string_view text)
{
    std::string result;
    for (std::size_t i = 0; i < text.size(); ++i) {
        char32_t character = text[i];
        const char32_t next = i + 1 < text.size() ? text[i + 1] : 0;
        if ((character & 0xFC00U) == 0xD800 && (next & 0xFC00U) == 0xDC00) {
            character = 0x10000 + ((character & 0x3FFU) << 10 | (next & 0x3FFU));
            ++i;
        }
        appendUTF8(result, isUnicodeCharacter(character) ? character : kReplacementCharacter);
    }
    return result;
}

std::u16string utf16FromUTF8(std::string_view text)
{
    std::u16string result;
    while (!text.empty()) {
        const auto [first, length] = firstOfUTF8(text);
        const char32_t character = length > 0 ? first : kReplacementCharacter;
        if (character >= 0x10000) {
            result += static_cast<char16_t>(0xD7C0 + (character >> 10)); // 0xD800 - (0x10000 >> 10)
            result += static_cast<char16_t>(0xDC00 | (character & 0x3FFU));
        } else {
            result += static_cast<char16_t>(character);
        }
        text.remove_prefix(length > 0 ? length : 1);
    }
    return result;
}

} // namespace orvex
