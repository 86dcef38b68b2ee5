#pragma once

#include "Value.h"

#include <algorithm>
#include <charconv>
#include <sstream>
#include <string>

namespace orvex::test {

// Bytes as a text that can be held against a format: words, one after the other.
//
//   3F 8001      bytes in hexadecimal
//   FF*14        a byte, or several, so many times
//   9:501 7:80   bit fields of that width and decimal value, from the lowest bit of the next byte on
//   @29          filled up to that offset
//
// Filling is 0xEE: bytes that nobody reads stand out when somebody does.
class ByteText {
public:
    explicit ByteText(const std::string& words, Bytes beginning = {})
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

inline Bytes bytesOfWords(const std::string& words, Bytes beginning = {})
{
    return ByteText(words, std::move(beginning)).bytes();
}

} // namespace orvex::test
