#pragma once

#include "PacketReader.h"

#include "TextFormat.h"

#include <charconv>
#include <sstream>

namespace orvex::test {

// Bytes as a text that can be held against a format: words, one after the other.
//
//   3F 8001      bytes in hexadecimal
//   FF*14        a byte, or several, so many times
//   9:501 7:80   bit fields of that width and decimal value, from the lowest bit of the next byte on
//   @29          filled up to that offset
//
// Filling is 0xEE: bytes that nobody reads stand out when somebody does.
class PacketText {
public:
    explicit PacketText(const std::string& words, Bytes beginning = {})
        : _bytes(std::move(beginning))
    {
        std::istringstream stream(words);
        for (std::string word; stream >> word;)
            append(word);
    }

    const Bytes& bytes() const { return _bytes; }

private:
    void append(const std::string& word)
    {
        const auto colon = word.find(':');
        if (colon != std::string::npos)
            return appendBits(number(word), number(word.substr(colon + 1)));
        _bit = 0;
        if (word[0] == '@')
            return _bytes.resize(number(word.substr(1)), 0xEE);
        const auto star = word.find('*');
        const auto times = star == std::string::npos ? 1 : number(word.substr(star + 1));
        for (std::size_t i = 0; i < times; ++i) {
            for (std::size_t digit = 0; digit < std::min(star, word.size()); digit += 2)
                _bytes.push_back(static_cast<std::uint8_t>(number(word.substr(digit, 2), 16)));
        }
    }
    void appendBits(std::size_t width, std::size_t value)
    {
        for (; width > 0; --width, value >>= 1, ++_bit) {
            if (_bit % 8 == 0)
                _bytes.push_back(0);
            _bytes.back() = static_cast<std::uint8_t>(_bytes.back() | (value & 1) << _bit % 8);
        }
    }
    static std::size_t number(const std::string& digits, int base = 10)
    {
        std::size_t value = 0;
        std::from_chars(digits.data(), digits.data() + digits.size(), value, base);
        return value;
    }

    Bytes _bytes;
    std::size_t _bit = 0; // where the next field begins
};

// The 13-byte header of a log packet, without length and time.
inline Bytes packetHeader(LogCode code)
{
    Bytes header(kPacketHeaderLength, 0xEE);
    header[0] = code >= kExtraCodeBase ? 255 : 1;
    header[3] = static_cast<std::uint8_t>(code);
    header[4] = static_cast<std::uint8_t>(code >> 8);
    return header;
}

// A log packet with this payload, whose bytes are given from packet byte 13 on.
inline Bytes packet(LogCode code, const Bytes& payload)
{
    Bytes result = packetHeader(code);
    result.insert(result.end(), payload.begin(), payload.end());
    return result;
}

// Cells of a cell-monitor list as a property list: "GSM Serving CellID=-5 ARFCN=7, UMTS Neighbor".
inline std::string cellList(const std::string& cells)
{
    std::string result = "<array>";
    std::istringstream stream(cells);
    for (std::string cell; std::getline(stream, cell, ',');) {
        std::istringstream words(cell);
        std::string radio;
        std::string type;
        words >> radio >> type;
        result += text("<dict><key>RadioAccessTechnology</key><string>%s</string><key>CellType</key>"
                       "<string>%s</string>",
            radio.c_str(), type.c_str());
        for (std::string entry; words >> entry;) {
            const auto equals = entry.find('=');
            result += text("<key>%s</key><integer>%s</integer>", entry.substr(0, equals).c_str(),
                entry.substr(equals + 1).c_str());
        }
        result += "</dict>";
    }
    return result + "</array>";
}

// "B0C1: 3F 80" with the code and the payload of a baseband packet, or of an extra packet "FF0001: " and
// cells, the inner part of a property list, or neither: a text.
inline Bytes packetOfText(const std::string& text)
{
    const auto colon = text.find(": ");
    const auto code = static_cast<LogCode>(std::stol(text, nullptr, 16));
    std::string payload = colon == std::string::npos ? "" : text.substr(colon + 2);
    if (code < kExtraCodeBase)
        return PacketText(payload, packetHeader(code)).bytes();
    if (code == kExtraCodeCellMonitorList && !payload.starts_with('<') && payload != "no list")
        payload = cellList(payload);
    if (payload.starts_with('<'))
        payload = "<plist version=\"1.0\">" + payload + "</plist>";
    return packet(code, Bytes(payload.begin(), payload.end()));
}

} // namespace orvex::test
