#pragma once

#include "LogCode.h"

#include "Value.h"

#include <cstddef>
#include <cstdint>

namespace orvex {

// A log packet without the optional two-byte prefix, as the sections get it:
//
//   0     u8    log type: 1 baseband packet, 255 extra packet
//   1     u16   not interpreted
//   3     u16   log code
//   5     8     time, not interpreted
//   13    ...   payload
using Packet = ByteView;

inline constexpr std::size_t kPacketHeaderLength = 13;

// The only code that touches raw bytes. Reads are little-endian; a read that is not wholly inside the packet
// yields 0.
class PacketReader {
public:
    explicit PacketReader(Packet packet)
        : _bytes(packet)
    {
    }

    std::size_t size() const { return _bytes.size(); }
    bool contains(std::size_t offset, std::size_t width) const
    {
        return offset <= size() && width <= size() - offset;
    }

    std::uint8_t u8(std::size_t offset) const { return static_cast<std::uint8_t>(number<1>(offset)); }
    std::uint16_t u16(std::size_t offset) const { return static_cast<std::uint16_t>(number<2>(offset)); }
    std::uint32_t u32(std::size_t offset) const { return number<4>(offset); }
    std::int8_t s8(std::size_t offset) const { return static_cast<std::int8_t>(u8(offset)); }
    std::int16_t s16(std::size_t offset) const { return static_cast<std::int16_t>(u16(offset)); }
    std::int32_t s32(std::size_t offset) const { return static_cast<std::int32_t>(u32(offset)); }

    // An unsigned bit field of up to 32 bits. Bit 0 is the least significant bit of the byte at the offset,
    // bit 8 that of the next byte.
    std::uint32_t bits(std::size_t offset, std::size_t firstBit, std::size_t width) const
    {
        const std::size_t firstByte = offset + firstBit / 8;
        const std::size_t shift = firstBit % 8;
        const std::size_t byteCount = (shift + width + 7) / 8; // at most five for 32 bits
        if (!contains(firstByte, byteCount))
            return 0;
        std::uint64_t window = 0;
        for (std::size_t i = 0; i < byteCount; ++i)
            window |= static_cast<std::uint64_t>(_bytes[firstByte + i]) << (8 * i);
        const std::uint64_t mask = (std::uint64_t{1} << width) - 1;
        return static_cast<std::uint32_t>((window >> shift) & mask);
    }

    // The bytes from the offset on; empty beyond the end.
    PacketReader from(std::size_t offset) const
    {
        return PacketReader(offset < size() ? _bytes.subspan(offset) : Packet());
    }
    Packet bytes() const { return _bytes; }

private:
    template <std::size_t width>
    std::uint32_t number(std::size_t offset) const
    {
        if (!contains(offset, width))
            return 0;
        std::uint32_t result = 0;
        for (std::size_t i = 0; i < width; ++i)
            result |= static_cast<std::uint32_t>(_bytes[offset + i]) << (8 * i);
        return result;
    }

    Packet _bytes;
};

} // namespace orvex
