#pragma once

#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// WCDMA searcher: the cells that the handset follows, all on one carrier.
//
//   13            s16  received power of the carrier, tenths of a dB, see rssi()
//   15            u8   n, number of cells
//   16+15i             cell i
//   16+15n+44i         energies of cell i
class LogCode_0x417A {
public:
    static constexpr LogCode kCode = 0x417A;
    static constexpr std::size_t kMinimumLength = 16;

    //   7  u16  bits 0-12 primary scrambling code, 13-15 set type: 0 active
    class Cell {
    public:
        explicit Cell(PacketReader record)
            : _record(record)
        {
        }

        int primaryScramblingCode() const { return static_cast<int>(_record.bits(7, 0, 13)); }
        bool isActive() const { return _record.bits(7, 13, 3) == 0; }

    private:
        PacketReader _record;
    };

    // Ec/Io as linear ratios, 2^19 for 0 dB.
    //
    //   32  u32  first
    //   36  u32  second
    //   40  u32  third
    class Energies {
    public:
        explicit Energies(PacketReader record)
            : _record(record)
        {
        }

        // The first that was measured (is not 0), else the third.
        std::uint32_t ecIo() const
        {
            for (const std::size_t offset : {32U, 36U}) {
                if (const std::uint32_t ratio = _record.u32(offset))
                    return ratio;
            }
            return _record.u32(40);
        }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x417A(Packet packet)
        : _packet(packet)
    {
    }

    // dBm, whole. Tenths are cut off toward zero before the offset, so below -51.2 dB it rounds the other
    // way.
    int rssi() const { return (_packet.s16(13) + 512) / 10 - 106; }

    RecordList<Cell> cells() const { return {_packet, 16, 15, cellCount()}; }
    RecordList<Energies> energies() const { return {_packet, 16 + 15 * cellCount(), 44, cellCount()}; }

private:
    std::size_t cellCount() const { return _packet.u8(15); }

    PacketReader _packet;
};

// "Active Set": the WCDMA cells that serve the handset at the same time, one row dictionary each.
class ActiveSet final : public PacketSection<LogCode_0x417A> {
public:
    ActiveSet(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x417A& report) override;
};

// A list of WCDMA cells outside the active set. Every searcher packet empties it, and nothing fills it.
class EmptyCellSet : public PacketSection<LogCode_0x417A> {
protected:
    EmptyCellSet(
        const char* sectionName, const char* entryWord, ClassDictionary& dict, CodeDictionary& codeDict);

    void update(const LogCode_0x417A& report) override;
};

// "Detected Set": WCDMA cells found that the network did not name.
class DetectedSet final : public EmptyCellSet {
public:
    DetectedSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : EmptyCellSet("Detected Set", "DetectedSet", dict, codeDict)
    {
    }
};

// "Monitored Set": WCDMA cells that the network wants measured.
class MonitoredSet final : public EmptyCellSet {
public:
    MonitoredSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : EmptyCellSet("Monitored Set", "MonitoredSet", dict, codeDict)
    {
    }
};

// "Virtual Active Set": WCDMA cells of another carrier that would make an active set there.
class VirtualActiveSet final : public EmptyCellSet {
public:
    VirtualActiveSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : EmptyCellSet("Virtual Active Set", "VirtualActiveSet", dict, codeDict)
    {
    }
};

} // namespace orvex
