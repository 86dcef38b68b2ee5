#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace orvex {

// Stands for what is no character.
inline constexpr char32_t kReplacementCharacter = 0xFFFD;

// Surrogates, the halves of characters in UTF-16, are none.
constexpr bool isUnicodeCharacter(char32_t number)
{
    return number <= 0x10FFFF && (number < 0xD800 || number > 0xDFFF);
}

// Appends a character, which is below U+110000, in UTF-8.
void appendUTF8(std::string& text, char32_t character);

struct UTF8Character {
    char32_t character = 0;
    std::size_t length = 0; // in bytes; 0 when the text does not start with a character in UTF-8
};

// The character that the text starts with. Surrogates and forms longer than they need be are none.
UTF8Character firstOfUTF8(std::string_view text);

// The same text, with U+FFFD for each half of a character, or byte, that makes none.
std::string utf8FromUTF16(std::u16string_view text);
std::u16string utf16FromUTF8(std::string_view text);

} // namespace orvex
