#pragma once

#include "PacketReader.h"

#include <algorithm>
#include <string_view>
#include <utility>
#include <vector>

namespace orvex::test {

// A log packet as a section gets it: the 13-byte header and this payload, whose bytes are given from packet
// byte 13 on.
inline Bytes packet(LogCode code, const Bytes& payload)
{
    Bytes result(kPacketHeaderLength, 0xEE); // header bytes that nobody reads stand out when somebody does
    result[0] = code >= kExtraCodeBase ? 255 : 1;
    result[3] = static_cast<std::uint8_t>(code);
    result[4] = static_cast<std::uint8_t>(code >> 8);
    result.insert(result.end(), payload.begin(), payload.end());
    return result;
}

// A packet of that length with these bytes at these offsets, both counted from packet byte 0, as far as they
// fit. What is not given is 0xEE.
inline Bytes packetWith(
    LogCode code, std::size_t length, const std::vector<std::pair<std::size_t, Bytes>>& fields)
{
    Bytes result = packet(code, {});
    for (const auto& [offset, bytes] : fields) {
        result.resize(std::max(result.size(), offset + bytes.size()), 0xEE);
        std::ranges::copy(bytes, result.begin() + static_cast<std::ptrdiff_t>(offset));
    }
    result.resize(length, 0xEE);
    return result;
}

// The same with the inner part of a property list in XML as payload.
inline Bytes propertyListPacket(LogCode code, std::string_view inner)
{
    std::string list = "<plist version=\"1.0\">";
    list += inner;
    list += "</plist>";
    return packet(code, Bytes(list.begin(), list.end()));
}

} // namespace orvex::test
