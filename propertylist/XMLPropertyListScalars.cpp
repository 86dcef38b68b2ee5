#include "XMLPropertyListScalars.h"

#include "DecimalPoint.h"
#include "XMLCharacters.h"

#include <QByteArray>
#include <QDateTime>

#include <algorithm>
#include <cctype>
#include <charconv>
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
    if (read.ec == std::errc::result_out_of_range) { // infinity or zero, which is what such a text means
        const DecimalPoint decimalPoint;
        number = std::strtod(std::string(digits).c_str(), nullptr);
    }
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
    const auto time = QDateTime::fromString(
        QString::fromLatin1(text.data(), static_cast<qsizetype>(text.size())), Qt::ISODate);
    if (!time.isValid())
        return {};
    return Date{static_cast<double>(time.toSecsSinceEpoch())};
}

Value data(std::string_view content)
{
    std::string digits(content);
    std::erase_if(digits, [](unsigned char character) { return std::isspace(character) != 0; });
    const auto decoded = QByteArray::fromBase64Encoding(
        QByteArray::fromStdString(digits), QByteArray::AbortOnBase64DecodingErrors);
    if (!decoded)
        return {};
    return std::make_shared<Bytes>((*decoded).begin(), (*decoded).end());
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

} // namespace orvex
