#pragma once

#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// WCDMA block errors of the downlink transport channels.
//
//   13     u8   number of transport channels
//   14     u16  window size
//   16+9i       transport channel i
class LogCode_0x4116 {
public:
    static constexpr LogCode kCode = 0x4116;
    static constexpr std::size_t kMinimumLength = 16;

    //   0  u8   identity
    //   1  s32  CRCs received
    //   5  s32  CRCs received in error
    class TransportChannel {
    public:
        explicit TransportChannel(PacketReader record)
            : _record(record)
        {
        }

        int identity() const { return _record.u8(0); }
        std::int32_t received() const { return _record.s32(1); }
        std::int32_t receivedInError() const { return _record.s32(5); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x4116(Packet packet)
        : _packet(packet)
    {
    }

    int windowSize() const { return _packet.u16(14); }
    RecordList<TransportChannel> transportChannels() const { return {_packet, 16, 9, _packet.u8(13)}; }

private:
    PacketReader _packet;
};

// "BLER": block errors of the WCDMA transport channels.
class BLER final : public PacketSection<LogCode_0x4116> {
public:
    BLER(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4116& report) override;
};

// HSDPA decoding: HARQ processes of one or two carriers.
//
//   13           u8      version
//   14           u16     bits 0-9 number of subframes, 10-11 carrier configuration
//   16           u8      p, number of processes on the primary carrier
//   17           u8      s, of those on the secondary carrier
//   18+9i                primary process i
//   18+162p+9j           secondary process j
//
// The secondary carrier's processes begin after room for 18p primary ones.
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

// "HSDPA Info": HARQ statistics of the WCDMA high-speed downlink. A carrier without processes in a packet
// keeps the list it had.
class HSDPAInformation final : public PacketSection<LogCode_0x4221> {
public:
    HSDPAInformation(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4221& report) override;
};

} // namespace orvex
