#pragma once

#include "GSM/GPRSInformation.h"
#include "GSM/GSMCells.h"
#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// GSM radio resource state.
//
//   13  u8  state
//   14  u8  sub-state
//   15  u8  status
//   16  u8  mode: 0 voice, any other data
class LogCode_0x512C {
public:
    static constexpr LogCode kCode = 0x512C;
    static constexpr std::size_t kMinimumLength = 17;

    explicit LogCode_0x512C(Packet packet)
        : _packet(packet)
    {
    }

    int state() const { return _packet.u8(13); }
    int subState() const { return _packet.u8(14); }
    int status() const { return _packet.u8(15); }
    bool isData() const { return _packet.u8(16) != 0; }

private:
    PacketReader _packet;
};

// GSM measurement report.
//
//   19  u8  not 0: discontinuous transmission in use
class LogCode_0x5072 {
public:
    static constexpr LogCode kCode = 0x5072;
    static constexpr std::size_t kMinimumLength = 20;

    explicit LogCode_0x5072(Packet packet)
        : _packet(packet)
    {
    }

    bool isDTXUsed() const { return _packet.u8(19) != 0; }

private:
    PacketReader _packet;
};

// "GSM RR Info": what the radio resource layer of GSM does.
class GSMRRInfo final : public PacketSection<LogCode_0x512C, LogCode_0x5137, LogCode_0x5072, LogCode_0x51F6> {
public:
    GSMRRInfo(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x512C& report) override;
    void update(const LogCode_0x5137& report) override;
    void update(const LogCode_0x5072& report) override;
    void update(const LogCode_0x51F6& report) override;
};

// GSM mobile allocation: the channels of frequency hopping.
//
//   13     u8   hopping sequence number
//   14     u8   number of channels
//   15+2i  u16  ARFCN i
class LogCode_0x51F8 {
public:
    static constexpr LogCode kCode = 0x51F8;
    static constexpr std::size_t kMinimumLength = 15;

    class Channel {
    public:
        explicit Channel(PacketReader record)
            : _record(record)
        {
        }

        int arfcn() const { return _record.u16(0); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x51F8(Packet packet)
        : _packet(packet)
    {
    }

    int hoppingSequenceNumber() const { return _packet.u8(13); }
    RecordList<Channel> channels() const { return {_packet, 15, 2, _packet.u8(14)}; }

private:
    PacketReader _packet;
};

// "Mobile Allocation": the channels that a hopping connection uses, in their order.
class MobileAllocation final : public PacketSection<LogCode_0x51F8> {
public:
    MobileAllocation(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x51F8& report) override;
};

} // namespace orvex
