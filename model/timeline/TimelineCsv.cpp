#include "TimelineCsv.h"

#include "Quantity.h"

#include <array>
#include <charconv>
#include <cmath>

namespace orvex {

namespace {

constexpr std::string_view kLineEnd = "\r\n";

void appendQuoted(std::string& line, std::string_view text)
{
    line += '"';
    for (const char character : text) {
        if (character == '"')
            line += '"';
        line += character;
    }
    line += '"';
}

void appendField(std::string& line, std::string_view text)
{
    if (text.find_first_of(",\"\r\n") == std::string_view::npos)
        line += text;
    else
        appendQuoted(line, text);
}

void appendNumber(std::string& line, double number)
{
    std::array<char, 32> digits; // NOLINT(cppcoreguidelines-pro-type-member-init)
    const auto [end, error] = std::to_chars(digits.data(), digits.data() + digits.size(), number);
    line.append(digits.data(), end);
}

} // namespace

TimelineCsv::TimelineCsv(std::ostream& stream)
    : _stream(stream)
{
    _stream << "time,path,key,text,number,unit" << kLineEnd;
}

void TimelineCsv::sample(Date time)
{
    _time = timestampOf(time);
}

void TimelineCsv::addRow(std::size_t /*number*/, const TimelineRow& row)
{
    std::string& fields = _rows.emplace_back(",");
    appendField(fields, row.path);
    fields += ',';
    appendField(fields, row.key);
    fields += ',';
}

void TimelineCsv::set(std::size_t number, const std::string& text)
{
    beginLine(number);
    if (text.empty())
        appendQuoted(_line, text);
    else
        appendField(_line, text);
    _line += ',';
    if (const auto quantity = quantityOf(text)) {
        appendNumber(_line, quantity->number);
        _line += ',';
        _line += quantity->unit;
    } else {
        _line += ',';
    }
    endLine();
}

void TimelineCsv::clear(std::size_t number)
{
    beginLine(number);
    _line += ",,";
    endLine();
}

void TimelineCsv::beginLine(std::size_t number)
{
    _line = _time;
    _line += _rows[number];
}

void TimelineCsv::endLine()
{
    _line += kLineEnd;
    _stream.write(_line.data(), static_cast<std::streamsize>(_line.size()));
}

std::string timestampOf(Date time)
{
    // Whole milliseconds first, so that 0.9996 s does not become 1000 ms.
    const double milliseconds = std::round(time.secondsSince1970 * 1000);
    const double seconds = std::floor(milliseconds / 1000);
    const std::string date = dateText({seconds}); // "2026-11-16 05:54:31 +0000"
    std::string fraction = std::to_string(static_cast<int>(milliseconds - seconds * 1000));
    fraction.insert(0, 3 - fraction.size(), '0');
    return date.substr(0, 10) + 'T' + date.substr(11, 8) + '.' + fraction + 'Z';
}

} // namespace orvex
