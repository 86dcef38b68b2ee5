#include "XMLText.h"

#include "PropertyListReaders.h"
#include "UTF8.h"

#include <algorithm>
#include <charconv>
#include <cstdint>

namespace orvex {

namespace {
constexpr struct {
    std::string_view name;
    char32_t character;
} kNamed[] = {{"amp", '&'}, {"lt", '<'}, {"gt", '>'}, {"quot", '"'}, {"apos", '\''}};

// The character of a reference, without '&' and ';'. Zero, which XML cannot hold, if there is none.
char32_t characterOf(std::string_view reference)
{
    for (const auto& [name, character] : kNamed) {
        if (name == reference)
            return character;
    }
    if (!reference.starts_with('#'))
        return 0;
    const bool isHexadecimal = reference.starts_with("#x");
    reference.remove_prefix(isHexadecimal ? 2 : 1);
    std::uint32_t number = 0;
    const char* end = reference.data() + reference.size();
    const auto read = std::from_chars(reference.data(), end, number, isHexadecimal ? 16 : 10);
    return read.ec == std::errc{} && read.ptr == end && isUnicodeCharacter(number) ? number : 0;
}

bool isPlain(char character)
{
    return (character >= ' ' && character <= '~') || character == '\n';
}

// The length of the first character of a non-empty text; 0 if XML cannot hold it.
std::size_t lengthOfFirst(std::string_view text)
{
    const auto [character, length] = firstOfUTF8(text);
    const bool isGood = character >= 0x20 ? character != 0xFFFE && character != 0xFFFF
                                          : character == U'\t' || character == U'\n' || character == U'\r';
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
        if (length > 0)
            result += text.substr(0, length);
        else
            appendUTF8(result, kReplacementCharacter);
        text.remove_prefix(std::max<std::size_t>(length, 1));
    }
    return result;
}

void appendXMLText(std::string& text, std::string_view raw)
{
    for (;;) {
        const std::size_t reference = raw.find('&');
        text += raw.substr(0, reference);
        if (reference == std::string_view::npos)
            return;
        raw.remove_prefix(reference + 1);
        const std::size_t length = raw.find(';');
        const char32_t character = length == std::string_view::npos ? 0 : characterOf(raw.substr(0, length));
        if (character == 0)
            throw PropertyListFault("a malformed reference to a character");
        appendUTF8(text, character);
        raw.remove_prefix(length + 1);
    }
}

} // namespace orvex
