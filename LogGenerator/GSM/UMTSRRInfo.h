#pragma once

#include "CellMonitorList.h"
#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

#include <optional>

namespace orvex {

// WCDMA transmit power over the last frames.
//
//   14      u8  number of entries
//   16+14i      entry i
class LogCode_0x4031 {
public:
    static constexpr LogCode kCode = 0x4031;
    static constexpr std::size_t kMinimumLength = 16;

    //   4  s16  transmit power, tenths of a dB, see transmitPower(); 0 stands for none
    class Entry {
    public:
        explicit Entry(PacketReader record)
            : _record(record)
        {
        }

        // dBm, whole; tenths are cut off toward zero before the offset.
        std::optional<int> transmitPower() const
        {
            const int tenths = _record.s16(4);
            return tenths == 0 ? std::nullopt : std::optional((tenths + 512) / 10 - 70);
        }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x4031(Packet packet)
        : _packet(packet)
    {
    }

    RecordList<Entry> entries() const { return {_packet, 16, 14, _packet.u8(14)}; }

private:
    PacketReader _packet;
};

// WCDMA RRC state.
//
//   13  u8  state
class LogCode_0x4125 {
public:
    static constexpr LogCode kCode = 0x4125;
    static constexpr std::size_t kMinimumLength = 14;

    explicit LogCode_0x4125(Packet packet)
        : _packet(packet)
    {
    }

    int state() const { return _packet.u8(13); }

private:
    PacketReader _packet;
};

// WCDMA serving cell.
//
//   13  s32  uplink UARFCN
//   17  s32  downlink UARFCN
//   21  s32  cell identity
//   25  u16  URA identity
class LogCode_0x4127 {
public:
    static constexpr LogCode kCode = 0x4127;
    static constexpr std::size_t kMinimumLength = 29;

    explicit LogCode_0x4127(Packet packet)
        : _packet(packet)
    {
    }

    std::int32_t uplinkUARFCN() const { return _packet.s32(13); }
    std::int32_t downlinkUARFCN() const { return _packet.s32(17); }
    std::int32_t cellIdentity() const { return _packet.s32(21); }
    int uraIdentity() const { return _packet.u16(25); }

private:
    PacketReader _packet;
};

// WCDMA ciphering.
//
//   13  u8  not 0: ciphered
class LogCode_0x4157 {
public:
    static constexpr LogCode kCode = 0x4157;
    static constexpr std::size_t kMinimumLength = 19;

    explicit LogCode_0x4157(Packet packet)
        : _packet(packet)
    {
    }

    bool isCiphered() const { return _packet.u8(13) != 0; }

private:
    PacketReader _packet;
};

// "UMTS RR Info": the WCDMA serving cell and what the radio resource layer does there, from the baseband and
// from the telephony service's cell-monitor list.
class UMTSRRInfo final
    : public PacketSection<LogCode_0x4125, LogCode_0x4031, LogCode_0x4127, LogCode_0x4157, CellMonitorList> {
public:
    UMTSRRInfo(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4125& report) override;
    void update(const LogCode_0x4031& report) override;
    void update(const LogCode_0x4127& report) override;
    void update(const LogCode_0x4157& report) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
