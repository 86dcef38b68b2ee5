#pragma once

#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// UTRAN intra-frequency neighbour measurement.
//
//   16       u8  bits 1-7 number of neighbours
//   168+16i  neighbour i
class LogCode_0xD00A {
public:
    static constexpr LogCode kCode = 0xD00A;
    static constexpr std::size_t kMinimumLength = 21;

    // A bit string of 16 bytes, of which the first 32 bits are read:
    //
    //   0-13   UARFCN
    //   14-20  cell identity
    //   21-28  filtered RSCP, 1/256
    //   29-30  set the cell belongs to
    //   31     in JDCS
    class Neighbor {
    public:
        explicit Neighbor(PacketReader record)
            : _record(record)
        {
        }

        int uarfcn() const { return bits(0, 14); }
        int cellIdentity() const { return bits(14, 7); }
        double filteredRSCP() const { return bits(21, 8) / 256.0; }
        int status() const { return bits(29, 2); }
        bool isInJDCS() const { return bits(31, 1) == 1; }

    private:
        int bits(std::size_t first, std::size_t width) const
        {
            return static_cast<int>(_record.bits(0, first, width));
        }

        PacketReader _record;
    };

    explicit LogCode_0xD00A(Packet packet)
        : _packet(packet)
    {
    }

    RecordList<Neighbor> neighbors() const { return {_packet, 168, 16, _packet.bits(16, 1, 7)}; }

private:
    PacketReader _packet;
};

// "Neighbor Cell List": the intra-frequency neighbours, one row dictionary each.
class UTRANNeighbhorMeasurements final : public PacketSection<LogCode_0xD00A> {
public:
    UTRANNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD00A& report) override;
};

// UTRAN measurement of GSM neighbours, none of which is shown.
//
//   16     u8  number of neighbours
//   17+8i  neighbour i:
//            0  u16  bits 0-13 cell identity, bit 14 band indicator, bit 15 BSIC valid
//            2  u8   network colour code
//            3  u8   base station colour code
//            4  u16  ARFCN
//            6  s16  RSSI
class LogCode_0xD00E {
public:
    static constexpr LogCode kCode = 0xD00E;
    static constexpr std::size_t kMinimumLength = 17;

    explicit LogCode_0xD00E(Packet) { }
};

// "GSM Neighbor Cell List": GSM neighbours seen from UTRAN. The list on screen has always been empty.
class GSMNeighbhorMeasurements final : public PacketSection<LogCode_0xD00E> {
public:
    GSMNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD00E& report) override;
};

} // namespace orvex
