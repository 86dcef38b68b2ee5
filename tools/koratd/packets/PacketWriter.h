#pragma once

#include "LogMessage.h"

#include <cstddef>
#include <span>

namespace orvex::korat {

// Makes one log message. Fields are written at their offset from packet byte 0, in any order; what is not
// written stays 0. The header, 13 bytes:
//
//   0  u8   log type: 1 baseband packet, 255 extra packet
//   1  u16  packet length less one (the length of the same packet as a DLF record, which has no log type)
//   3  u16  code; of an extra packet, the extra code
//   5  u64  time, microseconds since 1970
//
// Numbers are little-endian. A value that its field cannot hold is written as the nearest one it can. Writing
// outside the packet is a fault of the caller and throws std::out_of_range.
class PacketWriter {
public:
    static constexpr std::size_t kHeaderLength = 13;

    // A packet of the given length, header included.
    PacketWriter(LogCode code, Microseconds time, std::size_t length);

    void u8(std::size_t offset, std::int64_t value) { unsignedNumber(offset, 1, value); }
    void u16(std::size_t offset, std::int64_t value) { unsignedNumber(offset, 2, value); }
    void u32(std::size_t offset, std::int64_t value) { unsignedNumber(offset, 4, value); }
    void s8(std::size_t offset, std::int64_t value);
    void s16(std::size_t offset, std::int64_t value);
    void s32(std::size_t offset, std::int64_t value);
    // A field of a bit string that starts at a byte: bit 0 is the lowest bit of that byte, bit 8 the lowest
    // of the next one. Up to 32 bits wide; the other bits stay as they are.
    void bits(std::size_t base, unsigned firstBit, unsigned width, std::int64_t value);
    void copy(std::size_t offset, std::span<const std::uint8_t> bytes);

    // The finished message; the writer is empty afterwards.
    LogMessage take();

private:
    void unsignedNumber(std::size_t offset, unsigned bytes, std::int64_t value);
    void littleEndian(std::size_t offset, unsigned bytes, std::uint64_t value);

    LogMessage _message;
};

// The number of steps from the origin to a value, as measurements are coded: steps(-70, -140, 0.25) is 280.
std::int64_t steps(double value, double origin, double step);
// The ratio of powers that a number of decibels stands for.
double ratioOf(double decibels);

} // namespace orvex::korat
