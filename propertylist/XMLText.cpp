#include "XMLText.h"

#include "UTF8.h"

#include <algorithm>

namespace orvex {

namespace {
constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

bool isPlain(char character)
{
    return (character >= ' ' && character <= '~') || character == '\n';
}

// The length of the character that the text starts with; 0 when XML cannot hold it. The text is not empty.
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
        result += length ? text.substr(0, length) : kReplacement;
        text.remove_prefix(std::max<std::size_t>(length, 1));
    }
    return result;
}

} // namespace orvex
