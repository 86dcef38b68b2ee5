#pragma once

#include "PacketReader.h"

#include <string>
#include <utility>
#include <vector>

namespace orvex {

// A kind of packet that a technology decodes.
struct PacketKind {
    LogCode code;
    std::string name;          // what it reports, or the sections that want it
    std::size_t minimumLength; // a shorter one changes nothing
};

// What the message of a capture is, besides a packet with its log code.
inline constexpr LogCode kCodeOfPropertyList = -1; // a whole display, as IFX sends them
inline constexpr LogCode kCodeOfNoPacket = -2;     // shorter than a packet, or of no known log type
LogCode codeOfMessage(ByteView message);

// False for extra packets: the same ones come with every Marlin technology.
constexpr bool tellsTechnology(LogCode code)
{
    return code < kExtraCodeBase;
}

// All that a technology decodes.
class PacketKinds {
public:
    explicit PacketKinds(std::vector<PacketKind> kinds)
        : _kinds(std::move(kinds))
    {
    }

    // Null when nobody wants the code.
    const PacketKind* find(LogCode code) const;

private:
    std::vector<PacketKind> _kinds;
};

} // namespace orvex
