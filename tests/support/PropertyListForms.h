#pragma once

#include "Value.h"

#include <string>
#include <string_view>

namespace orvex::test {

// An XML property list around the given value.
inline std::string xmlList(std::string_view value)
{
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<plist version=\"1.0\">\n" + std::string(value)
        + "\n</plist>\n";
}

// A binary property list of the given objects, the first being the root: one-byte references and two-byte
// offsets.
inline Bytes binaryList(const std::vector<Bytes>& objects)
{
    Bytes list{'b', 'p', 'l', 'i', 's', 't', '0', '0'};
    Bytes offsets;
    for (const Bytes& object : objects) {
        offsets.push_back(static_cast<std::uint8_t>(list.size() >> 8));
        offsets.push_back(static_cast<std::uint8_t>(list.size()));
        list.insert(list.end(), object.begin(), object.end());
    }
    const std::size_t table = list.size();
    list.insert(list.end(), offsets.begin(), offsets.end());
    Bytes trailer(32);
    trailer[6] = 2;
    trailer[7] = 1;
    trailer[14] = static_cast<std::uint8_t>(objects.size() >> 8);
    trailer[15] = static_cast<std::uint8_t>(objects.size());
    trailer[30] = static_cast<std::uint8_t>(table >> 8);
    trailer[31] = static_cast<std::uint8_t>(table);
    list.insert(list.end(), trailer.begin(), trailer.end());
    return list;
}

inline Bytes bytesOf(std::string_view text)
{
    return {text.begin(), text.end()};
}

} // namespace orvex::test
