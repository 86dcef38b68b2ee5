#pragma once

#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// LTE connected-mode intra-frequency measurement.
//
//   17           u16  EARFCN
//   19           u16  serving physical cell identity
//   21           u16  subframe number
//   23           u16  serving filtered RSRP, 0.25 dB above -140 dBm
//   25           u16  serving filtered RSRQ, 0.125 dB above -20 dB
//   27           u8   n, number of measured neighbours
//   28           u8   m, number of detected cells
//   29+6i        measured neighbour i: u16 physical cell identity, u16 RSRP, u16 RSRQ, scaled as above
//   29+6n+2j     detected cell j: u16 physical cell identity
class LogCode_0xB179 {
public:
    static constexpr LogCode kCode = 0xB179;
    static constexpr std::size_t kMinimumLength = 29;

    class MeasuredNeighbor {
    public:
        explicit MeasuredNeighbor(PacketReader record)
            : _record(record)
        {
        }

        int physicalCellIdentity() const { return _record.u16(0); }
        double filteredRSRP() const { return rsrp(_record.u16(2)); }
        double filteredRSRQ() const { return rsrq(_record.u16(4)); }

    private:
        PacketReader _record;
    };

    class DetectedCell {
    public:
        explicit DetectedCell(PacketReader record)
            : _record(record)
        {
        }

        int physicalCellIdentity() const { return _record.u16(0); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0xB179(Packet packet)
        : _packet(packet)
    {
    }

    int earfcn() const { return _packet.u16(17); }
    int servingPhysicalCellIdentity() const { return _packet.u16(19); }
    int subframeNumber() const { return _packet.u16(21); }
    double servingFilteredRSRP() const { return rsrp(_packet.u16(23)); } // dBm
    double servingFilteredRSRQ() const { return rsrq(_packet.u16(25)); } // dB

    RecordList<MeasuredNeighbor> measuredNeighbors() const { return {_packet, 29, 6, neighborCount()}; }
    RecordList<DetectedCell> detectedCells() const
    {
        return {_packet, 29 + 6 * neighborCount(), 2, _packet.u8(28)};
    }

private:
    static double rsrp(int raw) { return raw * 0.25 - 140; }
    static double rsrq(int raw) { return raw * 0.125 - 20; }
    std::size_t neighborCount() const { return _packet.u8(27); }

    PacketReader _packet;
};

// "Connected mode LTE Intra-frequency Measurement": the serving cell as measured in connected mode.
class ConnectedModeMeasurementMisc final : public PacketSection<LogCode_0xB179> {
public:
    ConnectedModeMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB179& report) override;
};

// "Measured Neighbor Cells": the intra-frequency neighbours measured in connected mode, one row dictionary
// each.
class MeasuredNeighborCells final : public PacketSection<LogCode_0xB179> {
public:
    MeasuredNeighborCells(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB179& report) override;
};

// "Detected Cells": cells found in connected mode but not measured, one row dictionary each.
class DetectedCells final : public PacketSection<LogCode_0xB179> {
public:
    DetectedCells(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB179& report) override;
};

} // namespace orvex
