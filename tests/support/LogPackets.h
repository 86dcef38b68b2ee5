#pragma once

#include "PacketReader.h"

#include <string_view>

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

// The same with the inner part of a property list in XML as payload.
inline Bytes propertyListPacket(LogCode code, std::string_view inner)
{
    std::string list = "<plist version=\"1.0\">";
    list += inner;
    list += "</plist>";
    return packet(code, Bytes(list.begin(), list.end()));
}

} // namespace orvex::test
