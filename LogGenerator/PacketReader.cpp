#include "PacketReader.h"

namespace orvex {

std::uint32_t PacketReader::bits(std::size_t offset, std::size_t firstBit, std::size_t width) const
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

} // namespace orvex
