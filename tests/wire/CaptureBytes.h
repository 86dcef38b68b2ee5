#pragma once

#include "Value.h"

#include <bit>
#include <fstream>
#include <string>

namespace orvex::test {

inline Bytes& operator+=(Bytes& bytes, const Bytes& more)
{
    bytes.insert(bytes.end(), more.begin(), more.end());
    return bytes;
}

// A record of that length as it stands in a DLF; what is not its header is filled up.
inline Bytes dlfRecord(std::size_t length, std::uint8_t time, std::uint8_t fill = 0xEE)
{
    Bytes record{static_cast<std::uint8_t>(length), static_cast<std::uint8_t>(length >> 8), 0xC1, 0xB0, time,
        0x40, 0x1E, 0x18, 0x24, 0x0A, 0x06, 0x00};
    record.resize(length, fill);
    return record;
}

// The bytes of a classic pcap file, made by hand: 24 bytes of file header, 16 of header for each packet.
class PcapFile {
public:
    explicit PcapFile(
        std::uint32_t linkType = 147, bool isBigEndian = false, std::uint32_t magic = 0xA1B2C3D4)
        : _isBigEndian(isBigEndian)
    {
        put({magic, 4U << (isBigEndian ? 0 : 16) | 2U << (isBigEndian ? 16 : 0), 0, 0, 262144, linkType});
    }

    // A packet, 654321 micro- or nanoseconds after a second. The capture lacks its last bytes.
    PcapFile& add(const Bytes& message, std::uint32_t lacking = 0)
    {
        const auto length = static_cast<std::uint32_t>(message.size());
        put({1'700'000'000, 654'321, length - lacking, length});
        bytes.insert(bytes.end(), message.begin(), message.end() - lacking);
        return *this;
    }

    Bytes bytes;

private:
    void put(std::initializer_list<std::uint32_t> words)
    {
        for (const std::uint32_t word : words) {
            for (unsigned i = 0; i < 4; ++i)
                bytes.push_back(static_cast<std::uint8_t>(word >> 8 * (_isBigEndian ? 3 - i : i)));
        }
    }

    bool _isBigEndian;
};

inline std::string writeFile(const std::string& path, const Bytes& bytes)
{
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    return path;
}

} // namespace orvex::test
