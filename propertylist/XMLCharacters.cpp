#include "XMLCharacters.h"

#include "PropertyListCount.h"
#include "UTF8.h"

#include <QChar>

#include <charconv>
#include <cstdint>

namespace orvex {

namespace {
constexpr struct {
    std::string_view name;
    char32_t character;
} kNamed[] = {{"amp", '&'}, {"lt", '<'}, {"gt", '>'}, {"quot", '"'}, {"apos", '\''}};

// Zero when there is none; XML has no character with this number.
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
    const bool isCharacter =
        number <= QChar::LastValidCodePoint && !QChar::isSurrogate(static_cast<char32_t>(number));
    return read.ec == std::errc{} && read.ptr == end && isCharacter ? number : 0;
}
} // namespace

void appendXMLReference(std::string& text, std::string_view reference)
{
    const char32_t character = characterOf(reference);
    if (character == 0)
        throw PropertyListFault("a malformed reference to a character");
    appendUTF8(text, character);
}

} // namespace orvex
