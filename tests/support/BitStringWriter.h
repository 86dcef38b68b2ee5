#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

namespace orvex::test {

// Puts numbers into a bit string one bit at a time: bit 0 is the least significant bit of the first byte.
class BitStringWriter {
public:
    BitStringWriter& put(std::size_t first, std::size_t width, std::uint64_t value)
    {
        for (std::size_t bit = 0; bit < width; ++bit) {
            const std::size_t position = first + bit;
            if (_bytes.size() <= position / 8)
                _bytes.resize(position / 8 + 1);
            if (bit < 64 && ((value >> bit) & 1U))
                _bytes[position / 8] =
                    static_cast<std::uint8_t>(_bytes[position / 8] | (1U << (position % 8)));
        }
        return *this;
    }

    // The string, filled with zero bytes to this length.
    std::vector<std::uint8_t> bytes(std::size_t length) const
    {
        auto result = _bytes;
        result.resize(length);
        return result;
    }

private:
    std::vector<std::uint8_t> _bytes;
};

} // namespace orvex::test
