#pragma once

#include "Value.h"

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

// Records of all lengths, and between them bytes that make none; longer than what is read at once.
inline Bytes longDlf()
{
    Bytes dlf;
    for (std::size_t i = 0; dlf.size() < std::size_t{3} << 20; ++i) {
        dlf += dlfRecord(i % 97 == 0 ? 65'535 : 12 + i % 1'000, static_cast<std::uint8_t>(i), 0);
        if (i % 50 == 0)
            dlf += Bytes(i); // makes no record
    }
    dlf += Bytes(std::size_t{2} << 20); // longer than a window
    dlf += dlfRecord(40, 1);
    dlf += dlfRecord(50, 2);
    return dlf;
}

inline std::string writeFile(const std::string& path, const Bytes& bytes)
{
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    return path;
}

} // namespace orvex::test
