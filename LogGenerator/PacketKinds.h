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
    std::size_t minimumLength; // shorter packets change nothing
};

// Codes of messages that are not packets.
inline constexpr LogCode kCodeOfPropertyList = -1; // a whole display, as IFX sends them
inline constexpr LogCode kCodeOfNoPacket = -2;     // shorter than a packet, or of no known log type
LogCode codeOfMessage(ByteView message);

// False for extra packets, which every Marlin technology shares.
constexpr bool tellsTechnology(LogCode code)
{
    return code < kExtraCodeBase;
}

// All packets that a technology decodes.
class PacketKinds {
public:
    explicit PacketKinds(std::vector<PacketKind> kinds)
        : _kinds(std::move(kinds))
    {
    }

    // Null if the technology does not decode the code.
    const PacketKind* find(LogCode code) const;

private:
    std::vector<PacketKind> _kinds;
};

} // namespace orvex
