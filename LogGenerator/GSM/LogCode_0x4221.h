#pragma once

#include "PacketReader.h"
#include "RecordList.h"

namespace orvex {

// HSDPA decoding: HARQ processes of one or two carriers.
//
//   13           u8      version
//   14           u16     bits 0-9 number of subframes, 10-11 carrier configuration
//   16           u8      p, number of processes on the primary carrier
//   17           u8      s, of those on the secondary carrier
//   18+9i                primary process i
//   18+162p+9j           secondary process j
//
// The secondary carrier's processes stand behind room for 18 times as many primary ones as there are.
class LogCode_0x4221 {
public:
    static constexpr LogCode kCode = 0x4221;
    static constexpr std::size_t kMinimumLength = 18;

    //   0  u8   identity
    //   1  u32  bits received
    //   5  u16  new transmissions
    //   7  u16  block errors
    class Process {
    public:
        explicit Process(PacketReader record)
            : _record(record)
        {
        }

        unsigned identity() const { return _record.u8(0); }
        unsigned receivedBits() const { return _record.u32(1); }
        unsigned newTransmissions() const { return _record.u16(5); }
        unsigned blockErrors() const { return _record.u16(7); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x4221(Packet packet)
        : _packet(packet)
    {
    }

    unsigned version() const { return _packet.u8(13); }
    unsigned subframes() const { return _packet.bits(14, 0, 10); }
    int carrierConfiguration() const { return static_cast<int>(_packet.bits(14, 10, 2)); }

    RecordList<Process> primaryProcesses() const { return {_packet, 18, 9, primaryCount()}; }
    RecordList<Process> secondaryProcesses() const
    {
        return {_packet, 18 + 162 * primaryCount(), 9, _packet.u8(17)};
    }

private:
    std::size_t primaryCount() const { return _packet.u8(16); }

    PacketReader _packet;
};

} // namespace orvex
