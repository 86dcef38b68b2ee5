#include "LogCodesDocument.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <fstream>
#include <regex>
#include <stdexcept>

namespace orvex::test {

namespace {

std::vector<std::string> split(const std::string& text, const std::string& separator)
{
    std::vector<std::string> parts;
    std::size_t start = 0;
    for (std::size_t end = 0; (end = text.find(separator, start)) != std::string::npos;
         start = end + separator.size())
        parts.push_back(text.substr(start, end - start));
    parts.push_back(text.substr(start));
    return parts;
}

// Empty for any line but a row of a table.
Cells cellsOf(const std::string& line)
{
    if (!line.starts_with("| ") || !line.ends_with(" |"))
        return {};
    Cells cells = split(line.substr(1, line.size() - 2), " |");
    for (std::string& cell : cells) {
        cell.erase(0, cell.find_first_not_of(' '));
        cell.erase(cell.find_last_not_of(' ') + 1);
    }
    return cells;
}

std::size_t number(const std::string& digits)
{
    return digits.empty() ? 1 : std::stoul(digits);
}

// Where the first subpacket with that id begins. Subpackets begin at byte 17: u8 id, u16 size at 2.
std::optional<std::size_t> subpacket(const Bytes& packet, std::size_t id)
{
    for (std::size_t start = 17; start + 4 <= packet.size();) {
        if (packet[start] == id)
            return start;
        const std::size_t size = packet[start + 2] + 256U * packet[start + 3];
        if (size == 0)
            break;
        start += size;
    }
    return std::nullopt;
}

bool hasIndex(const std::string& text)
{
    static const std::regex pattern("[0-9+][ij]|/ [ij]( |$)");
    return std::regex_search(text, pattern);
}

} // namespace

int DocumentedField::records() const
{
    return hasIndex(offset) ? 2 : 1;
}

std::string DocumentedField::pathOf(int record) const
{
    static const std::regex index("/ [ij](?= |$)");
    return std::regex_replace(path, index, "/ " + std::to_string(record));
}

std::vector<std::uint64_t> DocumentedField::valuesWithText() const
{
    static const std::regex value("([0-9]+): ");
    std::vector<std::uint64_t> values;
    for (std::sregex_iterator match(shown.begin(), shown.end(), value); match != std::sregex_iterator();
         ++match)
        values.push_back(std::stoull((*match)[1]));
    return values;
}

std::optional<std::string> DocumentedField::expected(std::uint64_t raw, const std::string& actual) const
{
    if (isOpaque())
        return std::nullopt;
    auto value = static_cast<std::int64_t>(raw);
    if (type[0] == 's') {
        const std::int64_t sign = std::int64_t{1} << (std::stoi(type.substr(1)) - 1);
        value = (value ^ sign) - sign;
    }
    return textFor(shown, value, actual);
}

std::optional<DocumentedField::Place> DocumentedCode::place(
    const DocumentedField& field, const Bytes& packet, int record) const
{
    static const std::regex term("([0-9]*)(s[0-9]+|[a-z]|)");
    std::size_t byte = 0;
    for (const std::string& text : split(field.offset, "+")) {
        std::smatch match;
        if (!std::regex_match(text, match, term))
            throw std::runtime_error("unreadable offset " + field.offset);
        const std::string letter = match[2];
        if (letter.empty()) {
            byte += number(match[1]);
        } else if (letter.size() > 1) {
            const auto start = subpacket(packet, number(letter.substr(1)));
            if (!start)
                return std::nullopt;
            byte += *start;
        } else if (letter == "i" || letter == "j") {
            byte += number(match[1]) * static_cast<std::size_t>(record);
        } else {
            const auto count = std::ranges::find(fields, "*" + letter + "*", &DocumentedField::path);
            if (count == fields.end())
                throw std::runtime_error("nothing says what the letter stands for in " + field.offset);
            const auto where = place(*count, packet, record);
            if (!where)
                return std::nullopt;
            byte += number(match[1]) * valueAt(packet, *count, *where);
        }
    }

    static const std::regex type("[us]([0-9]+)(be)?|bits ([0-9]+)-([0-9]+)|([0-9]+) bytes");
    std::smatch match;
    if (!std::regex_match(field.type, match, type))
        throw std::runtime_error("unreadable type " + field.type);
    if (match[1].matched)
        return DocumentedField::Place{8 * byte, number(match[1])};
    if (match[5].matched)
        return DocumentedField::Place{8 * byte, 8 * number(match[5])};
    return DocumentedField::Place{8 * byte + number(match[3]), number(match[4]) - number(match[3]) + 1};
}

std::vector<DocumentedCode> documentedCodes()
{
    static const std::regex title("### 0x([0-9A-F]+): .*?(?:, ([0-9]+) bytes)?");
    std::vector<DocumentedCode> codes;
    std::string technology;
    std::ifstream file(ORVEX_DOCUMENTS "/log-codes.md");
    for (std::string line; std::getline(file, line);) {
        std::smatch match;
        if (line.starts_with("## ")) {
            technology = line.substr(3);
        } else if (std::regex_match(line, match, title)) {
            codes.push_back({.technology = technology,
                .code = std::stoi(match[1], nullptr, 16),
                .minimumLength = match[2].matched ? number(match[2]) : 0});
        } else if (line.starts_with("Sections: ")) {
            codes.back().sections = split(line.substr(10, line.size() - 11), ", ");
        } else if (const Cells cells = cellsOf(line); cells.size() == 4 && cells[0] != "offset") {
            codes.back().fields.push_back({cells[0], cells[1], cells[2], cells[3]});
        } else if (cells.size() > 1 && cells[0] != "technology" && cells[0] != "key" && cells.size() != 4) {
            codes.back().otherRows.push_back(cells);
        }
    }
    return codes;
}

std::optional<std::string> textFor(const std::string& shown, std::int64_t raw, const std::string& actual)
{
    static const std::regex formula("(?:([0-9.]+) × )?raw(?: / ([0-9]+))?(?: (\\+|−) ([0-9.]+))?(?: (.*))?");
    static const std::regex choice("([0-9]+): (.*)|else (.*)");
    for (const std::string& part : split(shown.empty() ? "raw" : shown, "; ")) {
        std::smatch match;
        if (std::regex_match(part, match, choice)) {
            if (match[3].matched) {
                static const std::regex rawInText("\\braw\\b");
                return std::regex_replace(match[3].str(), rawInText, std::to_string(raw));
            }
            if (std::stoll(match[1]) == raw)
                return match[2];
        } else if (std::regex_match(part, match, formula)) {
            double value = static_cast<double>(raw) * (match[1].matched ? std::stod(match[1]) : 1);
            value /= match[2].matched ? std::stod(match[2]) : 1;
            if (match[4].matched)
                value += std::stod(match[4]) * (match[3] == "+" ? 1 : -1);
            char* end = nullptr;
            const double read = std::strtod(actual.c_str(), &end);
            const std::string unit = match[5].matched ? " " + match[5].str() : "";
            // Texts have two decimals or more, so they are up to half a hundredth away.
            const bool agrees = end != actual.c_str() && end == unit && std::abs(read - value) < 0.0051;
            return agrees ? actual : std::to_string(value) + unit;
        }
    }
    return std::nullopt;
}

std::uint64_t valueAt(const Bytes& packet, const DocumentedField& field, DocumentedField::Place place)
{
    std::uint64_t value = 0;
    for (std::size_t i = 0; i < place.width; ++i) {
        const std::size_t bit = place.firstBit + i;
        if (bit / 8 < packet.size() && ((packet[bit / 8] >> (bit % 8)) & 1) != 0)
            value |= std::uint64_t{1} << i;
    }
    return field.type.ends_with("be") ? (value >> 8 | (value & 0xFF) << 8) : value;
}

void setValue(Bytes& packet, const DocumentedField& field, DocumentedField::Place place, std::uint64_t value)
{
    if (field.type.ends_with("be"))
        value = value >> 8 | (value & 0xFF) << 8;
    for (std::size_t i = 0; i < place.width; ++i) {
        const std::size_t bit = place.firstBit + i;
        const auto mask = static_cast<std::uint8_t>(1U << (bit % 8));
        packet.at(bit / 8) = static_cast<std::uint8_t>(
            ((value >> i) & 1) != 0 ? packet[bit / 8] | mask : packet[bit / 8] & ~mask);
    }
}

} // namespace orvex::test
