#pragma once

#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// LTE idle-mode neighbour measurement.
//
//   13        u8   version
//   17        u16  EARFCN
//   19        u16  bits 0-5 Qrxlevmin, 2 dB above -140 dBm; bits 6-10 number of cells less one
//   21+20i    neighbour cell i
class LogCode_0xB180 {
public:
    static constexpr LogCode kCode = 0xB180;
    static constexpr std::size_t kMinimumLength = 21;

    // A bit string of 20 bytes:
    //
    //   0-8      physical cell identity
    //   9-16     measured RSSI, 0.5 dB above -140 dBm
    //   17-25    measured RSRP, 0.5 dB above -140 dBm: twice the serving cell's step
    //   32-40    average RSRP, the same
    //   41-47    measured RSRQ, 0.25 dB above -30 dB
    //   48-54    average RSRQ, the same
    //   55-61    Srxlev, above -30
    //   64-79    frequency offset
    //   96-106   antenna 0 frame offset
    //   107-125  antenna 0 sample offset
    class NeighborCell {
    public:
        explicit NeighborCell(PacketReader record)
            : _record(record)
        {
        }

        int physicalCellIdentity() const { return bits(0, 9); }
        double measuredRSSI() const { return bits(9, 8) * 0.5 - 140; }
        double measuredRSRP() const { return bits(17, 9) * 0.5 - 140; }
        double averageRSRP() const { return bits(32, 9) * 0.5 - 140; }
        double measuredRSRQ() const { return bits(41, 7) * 0.25 - 30; }
        double averageRSRQ() const { return bits(48, 7) * 0.25 - 30; }
        int srxlev() const { return bits(55, 7) - 30; }
        int frequencyOffset() const { return _record.u16(8); }
        int antenna0FrameOffset() const { return bits(96, 11); }
        int antenna0SampleOffset() const { return bits(107, 19); }

    private:
        int bits(std::size_t first, std::size_t width) const
        {
            return static_cast<int>(_record.bits(0, first, width));
        }

        PacketReader _record;
    };

    explicit LogCode_0xB180(Packet packet)
        : _packet(packet)
    {
    }

    int version() const { return _packet.u8(13); }
    int earfcn() const { return _packet.u16(17); }
    int qRxLevMin() const { return 2 * static_cast<int>(_packet.bits(19, 0, 6)) - 140; }
    RecordList<NeighborCell> neighborCells() const
    {
        return {_packet, 21, 20, _packet.bits(19, 6, 5) + std::size_t{1}};
    }

private:
    PacketReader _packet;
};

// "Neighbor Measurements": what the idle-mode neighbour measurement says of its layer.
class NeighborMeasurementMisc final : public PacketSection<LogCode_0xB180> {
public:
    NeighborMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB180& report) override;
};

// "Neighbor Cells List": the neighbours measured in idle mode, one row dictionary each.
class NeighborCellsList final : public PacketSection<LogCode_0xB180> {
public:
    NeighborCellsList(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB180& report) override;
};

} // namespace orvex
