#include "UTF8.h"

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

} // namespace orvex
