#pragma once

#include "PacketReader.h"

#include <optional>

namespace orvex {

// A subpacket, from its start to the end of the packet. A field that the packet does not hold has no value.
class Subpacket {
public:
    explicit Subpacket(PacketReader bytes)
        : _bytes(bytes)
    {
    }

    bool contains(std::size_t offset, std::size_t width) const { return _bytes.contains(offset, width); }
    std::optional<int> u8(std::size_t offset) const { return ifThere(offset, 1, _bytes.u8(offset)); }
    std::optional<int> u16(std::size_t offset) const { return ifThere(offset, 2, _bytes.u16(offset)); }
    std::optional<int> s8(std::size_t offset) const { return ifThere(offset, 1, _bytes.s8(offset)); }
    std::optional<int> s16(std::size_t offset) const { return ifThere(offset, 2, _bytes.s16(offset)); }

private:
    std::optional<int> ifThere(std::size_t offset, std::size_t width, int value) const
    {
        return contains(offset, width) ? std::optional(value) : std::nullopt;
    }

    PacketReader _bytes;
};

// The subpackets of a 1x packet, one after another:
//
//   14  u8  number of subpackets
//   17      first subpacket
//
//   0   u8   id
//   2   u16  size, from the id to the next subpacket
class SubpacketWalk {
public:
    explicit SubpacketWalk(Packet packet)
        : _packet(packet)
    {
    }

    // The first subpacket with that id. None when there is none, when the packet ends inside a header, or,
    // with a log line, when a subpacket claims to end far beyond the packet.
    std::optional<Subpacket> find(int id) const;

private:
    PacketReader _packet;
};

} // namespace orvex
