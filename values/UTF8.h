#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace orvex {

// Appends a character, which is below U+110000, in UTF-8. Every character is kept: converters of whole texts
// take a U+FEFF at the start for a mark of the byte order, and drop it.
void appendUTF8(std::string& text, char32_t character);

struct UTF8Character {
    char32_t character = 0;
    std::size_t length = 0; // in bytes; 0 when the text does not start with a character in UTF-8
};

// The character that the text starts with. Surrogates and forms longer than they need be are none.
UTF8Character firstOfUTF8(std::string_view text);

} // namespace orvex
