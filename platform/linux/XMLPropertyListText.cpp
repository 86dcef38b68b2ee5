#include "XMLPropertyListText.h"

#include <algorithm>
#include <cctype>
#include <charconv>
#include <cstdint>
#include <limits>

namespace orvex {

namespace {
std::string_view trimmed(std::string_view text)
{
    constexpr std::string_view kWhiteSpace = " \t\r\n";
    const std::size_t first = text.find_first_not_of(kWhiteSpace);
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(kWhiteSpace) - first + 1);
}

bool takeSign(std::string_view& text)
{
    const bool isNegative = text.starts_with('-');
    if (isNegative || text.starts_with('+'))
        text.remove_prefix(1);
    return isNegative;
}

bool isInteger(std::string_view text)
{
    const bool isNegative = takeSign(text);
    const bool isHexadecimal = text.starts_with("0x") || text.starts_with("0X");
    if (isHexadecimal)
        text.remove_prefix(2);
    std::uint64_t magnitude = 0;
    const char* end = text.data() + text.size();
    const auto read = std::from_chars(text.data(), end, magnitude, isHexadecimal ? 16 : 10);
    constexpr std::uint64_t kLowest = std::uint64_t{1} << 63;
    return read.ec == std::errc{} && read.ptr == end && (!isNegative || magnitude <= kLowest);
}

bool isReal(std::string_view text)
{
    takeSign(text);
    if (text.starts_with('-') || text.starts_with('+'))
        return false;
    double number = 0;
    const char* end = text.data() + text.size();
    const auto read = std::from_chars(text.data(), end, number);
    // Out of range is infinity or zero, which is what such a text means.
    return (read.ec == std::errc{} || read.ec == std::errc::result_out_of_range) && read.ptr == end;
}

bool isDate(std::string_view text)
{
    constexpr std::string_view kForm = "dddd-dd-ddTdd:dd:ddZ";
    return std::equal(text.begin(), text.end(), kForm.begin(), kForm.end(), [](char character, char form) {
        return form == 'd' ? std::isdigit(static_cast<unsigned char>(character)) != 0 : character == form;
    });
}

bool isBase64(std::string_view text)
{
    return std::all_of(text.begin(), text.end(), [](unsigned char character) {
        return std::isalnum(character) || std::isspace(character)
            || std::string_view("+/=").find(static_cast<char>(character)) != std::string_view::npos;
    });
}

bool isAnything(std::string_view)
{
    return true;
}
bool isNothing(std::string_view text)
{
    return text.empty();
}

constexpr struct {
    std::string_view element;
    bool (*isGood)(std::string_view);
} kElements[] = {
    {"string", isAnything},
    {"key", isAnything},
    {"integer", isInteger},
    {"real", isReal},
    {"date", isDate},
    {"data", isBase64},
    {"true", isNothing},
    {"false", isNothing},
};
} // namespace

XMLPropertyListText checkXMLPropertyListText(std::string_view element, std::string_view content)
{
    for (const auto& known : kElements) {
        if (known.element == element)
            return known.isGood(trimmed(content)) ? XMLPropertyListText::good
                                                  : XMLPropertyListText::malformed;
    }
    return XMLPropertyListText::unknownElement;
}

} // namespace orvex
