#pragma once

#include "MessagePort.h"

#include <algorithm>
#include <bit>
#include <fstream>

namespace orvex::test {

// The bytes of a classic pcap file, made by hand: 24 bytes of file header, 16 of header for each packet.
class PcapFile {
public:
    explicit PcapFile(
        std::uint32_t linkType = 147, bool isBigEndian = false, std::uint32_t magic = 0xA1B2C3D4)
        : _isBigEndian(isBigEndian)
    {
        put(magic, 4);
        put(2, 2);
        put(4, 2);
        put(0, 8);
        put(262144, 4);
        put(linkType, 4);
    }

    // A packet, 654321 micro- or nanoseconds after a second, of which the capture holds the first `captured`
    // bytes.
    PcapFile& add(const Bytes& message, std::size_t captured = static_cast<std::size_t>(-1))
    {
        captured = std::min(captured, message.size());
        put(1'700'000'000, 4);
        put(654'321, 4);
        put(captured, 4);
        put(message.size(), 4);
        _bytes.insert(_bytes.end(), message.begin(), message.begin() + static_cast<std::ptrdiff_t>(captured));
        return *this;
    }

    PcapFile& cut(std::size_t count)
    {
        _bytes.resize(_bytes.size() - count);
        return *this;
    }

    const Bytes& bytes() const { return _bytes; }

private:
    void put(std::uint64_t value, std::size_t width)
    {
        for (std::size_t i = 0; i < width; ++i) {
            const std::size_t shift = 8 * (_isBigEndian ? width - 1 - i : i);
            _bytes.push_back(static_cast<std::uint8_t>(value >> shift));
        }
    }

    bool _isBigEndian;
    Bytes _bytes;
};

inline std::string writeFile(const std::string& path, const Bytes& bytes)
{
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    return path;
}

} // namespace orvex::test
