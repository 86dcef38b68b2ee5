#pragma once

#include <string>

namespace orvex {

// Appends a character, which is below U+110000, in UTF-8. Every character is kept: converters of whole texts
// take a U+FEFF at the start for a mark of the byte order, and drop it.
void appendUTF8(std::string& text, char32_t character);

} // namespace orvex
