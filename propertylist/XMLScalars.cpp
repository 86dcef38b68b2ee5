#include "XMLScalars.h"

#include "XMLText.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <charconv>
#include <chrono>
#include <cstdint>
#include <cstdlib>
#include <limits>

namespace orvex {

namespace {
std::string_view trimmed(std::string_view text)
{
    while (!text.empty() && isXMLWhiteSpace(text.front()))
        text.remove_prefix(1);
    while (!text.empty() && isXMLWhiteSpace(text.back()))
        text.remove_suffix(1);
    return text;
}

bool takeSign(std::string_view& text)
{
    const bool isNegative = text.starts_with('-');
    if (isNegative || text.starts_with('+'))
        text.remove_prefix(1);
    return isNegative;
}

Value text(std::string_view content)
{
    return content;
}

Value integer(std::string_view content)
{
    std::string_view digits = trimmed(content);
    const bool isNegative = takeSign(digits);
    const bool isHexadecimal = digits.starts_with("0x") || digits.starts_with("0X");
    if (isHexadecimal)
        digits.remove_prefix(2);
    std::uint64_t magnitude = 0;
    const char* end = digits.data() + digits.size();
    const auto read = std::from_chars(digits.data(), end, magnitude, isHexadecimal ? 16 : 10);
    constexpr std::uint64_t kLowest = std::uint64_t{1} << 63;
    if (read.ec != std::errc{} || read.ptr != end || (isNegative && magnitude > kLowest))
        return {};
    if (!isNegative && magnitude >= kLowest)
        return static_cast<double>(magnitude);
    return static_cast<std::int64_t>(isNegative ? 0 - magnitude : magnitude);
}

Value real(std::string_view content)
{
    std::string_view digits = trimmed(content);
    const bool isNegative = takeSign(digits);
    if (digits.starts_with('-'))
        return {};
    double number = 0;
    const char* end = digits.data() + digits.size();
    const auto read = std::from_chars(digits.data(), end, number);
    if (read.ptr != end || read.ec == std::errc::invalid_argument)
        return {};
    if (read.ec == std::errc::result_out_of_range) // becomes infinity or zero
        number = std::strtod(std::string(digits).c_str(), nullptr);
    return isNegative ? -number : number;
}

Value date(std::string_view content)
{
    constexpr std::string_view kForm = "dddd-dd-ddTdd:dd:ddZ";
    const std::string_view text = trimmed(content);
    const auto fits = [](char character, char form) {
        return form == 'd' ? std::isdigit(static_cast<unsigned char>(character)) != 0 : character == form;
    };
    if (!std::equal(text.begin(), text.end(), kForm.begin(), kForm.end(), fits))
        return {};
    const auto number = [text](std::size_t offset, std::size_t width) {
        int result = 0;
        for (const char digit : text.substr(offset, width))
            result = result * 10 + (digit - '0');
        return result;
    };
    using namespace std::chrono;
    const year_month_day day(year(number(0, 4)), month(static_cast<unsigned>(number(5, 2))),
        std::chrono::day(static_cast<unsigned>(number(8, 2))));
    const hours hour(number(11, 2));
    const minutes minute(number(14, 2));
    const seconds second(number(17, 2));
    const seconds time = hour + minute + second;
    const bool isEndOfDay = hour == 24h && time == 24h;
    if (!day.ok() || day.year() < year(1) || (hour >= 24h && !isEndOfDay) || minute >= 60min || second >= 60s)
        return {};
    return Date{static_cast<double>((sys_days(day) + time).time_since_epoch().count())};
}

constexpr std::string_view kBase64Digits = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
constexpr std::uint8_t kSpace = 0x40;
constexpr std::uint8_t kNoDigit = 0x80;

constexpr auto kBase64Values = [] {
    std::array<std::uint8_t, 256> values{};
    values.fill(kNoDigit);
    for (const char space : {' ', '\t', '\n', '\v', '\f', '\r'})
        values[static_cast<unsigned char>(space)] = kSpace;
    for (std::size_t i = 0; i < kBase64Digits.size(); ++i)
        values[static_cast<unsigned char>(kBase64Digits[i])] = static_cast<std::uint8_t>(i);
    return values;
}();

// Padding is optional. If present, it completes the last group and only space follows.
Value data(std::string_view content)
{
    auto bytes = std::make_shared<Bytes>();
    bytes->reserve(content.size() / 4 * 3 + 3);
    std::size_t digits = 0;
    std::size_t padding = 0;
    std::uint32_t group = 0;
    for (const char character : content) {
        const std::uint8_t value = kBase64Values[static_cast<unsigned char>(character)];
        if (value == kSpace)
            continue;
        if (value == kNoDigit || padding > 0) {
            if (character != '=')
                return {};
            ++padding;
            continue;
        }
        group = group << 6 | value;
        if (++digits % 4 == 0) {
            for (const int shift : {16, 8, 0})
                bytes->push_back(static_cast<std::uint8_t>(group >> shift));
        }
    }
    if (padding > 2 || (padding > 0 && (digits + padding) % 4 != 0))
        return {};
    if (digits % 4 >= 2)
        bytes->push_back(static_cast<std::uint8_t>(digits % 4 == 2 ? group >> 4 : group >> 10));
    if (digits % 4 == 3)
        bytes->push_back(static_cast<std::uint8_t>(group >> 2));
    return bytes;
}

template <bool kFlag>
Value flag(std::string_view content)
{
    return trimmed(content).empty() ? Value(kFlag) : Value();
}

constexpr struct {
    std::string_view element;
    XMLScalarReader read;
} kElements[] = {
    {"integer", integer},
    {"string", text},
    {"true", flag<true>},
    {"false", flag<false>},
    {"real", real},
    {"data", data},
    {"date", date},
};
} // namespace

XMLScalarReader xmlScalarReader(std::string_view element)
{
    for (const auto& known : kElements) {
        if (known.element == element)
            return known.read;
    }
    return nullptr;
}

void appendBase64(std::string& text, ByteView bytes)
{
    for (std::size_t i = 0; i < bytes.size(); i += 3) {
        const std::size_t count = std::min<std::size_t>(3, bytes.size() - i);
        std::uint32_t group = 0;
        for (std::size_t j = 0; j < 3; ++j)
            group = group << 8 | (j < count ? bytes[i + j] : 0U);
        for (std::size_t j = 0; j < 4; ++j)
            text += j <= count ? kBase64Digits[group >> (18 - 6 * j) & 0x3F] : '=';
    }
}

} // namespace orvex
