#pragma once

#include "PacketWriter.h"

#include <vector>

namespace orvex::korat {

// Makes a message that holds subpackets.
//
//   14  u8  number of subpackets
//   17  the first subpacket; the others stand right behind each other
//
// A subpacket starts with a header of 4 bytes: u8 identity at 0, u16 length at 2, header included.
class C2KSubpacketWriter {
public:
    C2KSubpacketWriter(LogCode code, Microseconds time, const std::vector<std::size_t>& lengths);

    // Starts the next of the subpackets; offsets count from its first byte from now on.
    void start(int identity);

    void u8(std::size_t offset, std::int64_t value) { _packet.u8(_start + offset, value); }
    void s8(std::size_t offset, std::int64_t value) { _packet.s8(_start + offset, value); }
    void u16(std::size_t offset, std::int64_t value) { _packet.u16(_start + offset, value); }
    void s16(std::size_t offset, std::int64_t value) { _packet.s16(_start + offset, value); }

    LogMessage take() { return _packet.take(); }

private:
    PacketWriter _packet;
    std::vector<std::size_t> _lengths;
    std::size_t _next = 0; // subpacket
    std::size_t _start;    // of the subpacket that is being written
};

} // namespace orvex::korat
