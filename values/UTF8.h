#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace orvex {

// Replaces what is not a valid character.
inline constexpr char32_t kReplacementCharacter = 0xFFFD;

// False for surrogates and for numbers beyond U+10FFFF.
constexpr bool isUnicodeCharacter(char32_t number)
{
    return number <= 0x10FFFF && (number < 0xD800 || number > 0xDFFF);
}

// Appends a character below U+110000 in UTF-8.
void appendUTF8(std::string& text, char32_t character);

struct UTF8Character {
    char32_t character = 0;
    std::size_t length = 0; // in bytes; 0 if the text does not start with valid UTF-8
};

// The first character of the text. Surrogates and overlong forms are invalid.
UTF8Character firstOfUTF8(std::string_view text);

// The same text with U+FFFD for each unpaired surrogate or invalid byte.
std::string utf8FromUTF16(std::u16string_view text);
std::u16string utf16FromUTF8(std::string_view text);

} // namespace orvex
