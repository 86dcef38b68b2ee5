#include "PacketWriter.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

namespace orvex::korat {

namespace {
constexpr std::uint8_t kBasebandPacket = 1;
constexpr std::uint8_t kExtraPacket = 255;

std::int64_t largestOf(unsigned bits)
{
    return (std::int64_t{1} << bits) - 1;
}

template <typename Integer>
std::int64_t clampedTo(std::int64_t value)
{
    return std::clamp<std::int64_t>(
        value, std::numeric_limits<Integer>::min(), std::numeric_limits<Integer>::max());
}
} // namespace

PacketWriter::PacketWriter(LogCode code, Microseconds time, std::size_t length)
    : _message{code, Bytes(std::max(length, kHeaderLength))}
{
    u8(0, code >= kExtraCodeBase ? kExtraPacket : kBasebandPacket);
    u16(1, static_cast<std::int64_t>(_message.bytes.size()) - 1);
    u16(3, code & 0xFFFF);
    littleEndian(5, 8, static_cast<std::uint64_t>(time.count()));
}

void PacketWriter::s8(std::size_t offset, std::int64_t value)
{
    littleEndian(offset, 1, static_cast<std::uint64_t>(clampedTo<std::int8_t>(value)));
}

void PacketWriter::s16(std::size_t offset, std::int64_t value)
{
    littleEndian(offset, 2, static_cast<std::uint64_t>(clampedTo<std::int16_t>(value)));
}

void PacketWriter::s32(std::size_t offset, std::int64_t value)
{
    littleEndian(offset, 4, static_cast<std::uint64_t>(clampedTo<std::int32_t>(value)));
}

void PacketWriter::bits(std::size_t base, unsigned firstBit, unsigned width, std::int64_t value)
{
    const auto field = static_cast<std::uint64_t>(std::clamp<std::int64_t>(value, 0, largestOf(width)));
    for (unsigned i = 0; i < width; ++i) {
        const unsigned bit = firstBit + i;
        const auto mask = static_cast<std::uint8_t>(1U << (bit % 8));
        std::uint8_t& byte = _message.bytes.at(base + bit / 8);
        byte = static_cast<std::uint8_t>((field >> i & 1) != 0 ? byte | mask : byte & ~mask);
    }
}

void PacketWriter::copy(std::size_t offset, std::span<const std::uint8_t> bytes)
{
    for (const std::uint8_t byte : bytes)
        _message.bytes.at(offset++) = byte;
}

LogMessage PacketWriter::take()
{
    return std::exchange(_message, {});
}

void PacketWriter::unsignedNumber(std::size_t offset, unsigned bytes, std::int64_t value)
{
    littleEndian(
        offset, bytes, static_cast<std::uint64_t>(std::clamp<std::int64_t>(value, 0, largestOf(8 * bytes))));
}

void PacketWriter::littleEndian(std::size_t offset, unsigned bytes, std::uint64_t value)
{
    for (unsigned i = 0; i < bytes; ++i)
        _message.bytes.at(offset + i) = static_cast<std::uint8_t>(value >> (8 * i));
}

std::int64_t steps(double value, double origin, double step)
{
    return std::llround((value - origin) / step);
}

double ratioOf(double decibels)
{
    return std::pow(10, decibels / 10);
}

} // namespace orvex::korat
