#include "VisibleText.h"

#include "TextFormat.h"
#include "UTF8.h"

#include <algorithm>

namespace orvex {

namespace {

bool isPlain(char character)
{
    return character >= ' ' && character <= '~';
}

// Bidirectional embeddings, overrides and isolates.
bool isDirectionControl(char32_t character)
{
    return (character >= 0x202A && character <= 0x202E) || (character >= 0x2066 && character <= 0x2069);
}

std::string visible(std::string_view bytes, char32_t character)
{
    const bool isControl = character < 0x20 || (character >= 0x7F && character < 0xA0);
    if (character == U'\n' || character == U'\t')
        return character == U'\n' ? "\\n" : "\\t";
    if (isControl)
        return text("\\x%02x", static_cast<unsigned>(character));
    if (character == 0x2028 || character == 0x2029 || isDirectionControl(character))
        return text("\\u%04x", static_cast<unsigned>(character));
    return std::string(bytes);
}

} // namespace

std::string visibleText(std::string_view text, std::size_t longest)
{
    if (text.size() <= longest && std::ranges::all_of(text, isPlain))
        return std::string(text);
    std::string result;
    while (!text.empty()) {
        const auto [character, length] = firstOfUTF8(text);
        const auto byte = static_cast<unsigned char>(text.front());
        const std::string next =
            length > 0 ? visible(text.substr(0, length), character) : orvex::text("\\x%02x", byte);
        if (next.size() > longest - result.size())
            return result += "…";
        result += next;
        text.remove_prefix(std::max<std::size_t>(length, 1));
    }
    return result;
}

} // namespace orvex
