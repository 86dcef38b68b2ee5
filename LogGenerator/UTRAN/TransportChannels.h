#pragma once

#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// UTRAN transport channels: block error rates and, per coded composite channel, SIR.
//
//   14          u16  bits 6-11 t, number of transport channels; bits 12-15 k, of composite channels
//   17+2i       transport channel i
//   289+34t+8j  composite channel j
class LogCode_0xD00C {
public:
    static constexpr LogCode kCode = 0xD00C;
    static constexpr std::size_t kMinimumLength = 17;

    //   0  u8  transport channel identity
    //   1  u8  block error rate, as measured
    class TransportChannel {
    public:
        explicit TransportChannel(PacketReader record)
            : _record(record)
        {
        }

        int identity() const { return _record.u8(0); }
        int blockErrorRate() const { return _record.u8(1); }

    private:
        PacketReader _record;
    };

    //   0    u8  composite channel identity
    //   1    u8  time slot number
    //   2+i  u8  SIR i of 6
    class CompositeChannel {
    public:
        static constexpr std::size_t kSIRCount = 6;

        explicit CompositeChannel(PacketReader record)
            : _record(record)
        {
        }

        int identity() const { return _record.u8(0); }
        int timeSlotNumber() const { return _record.u8(1); }
        // Throws ArrayOutOfBoundsException from kSIRCount on.
        int sir(std::size_t index) const
        {
            if (index >= kSIRCount)
                throw ArrayOutOfBoundsException();
            return _record.u8(2 + index);
        }

    private:
        PacketReader _record;
    };

    explicit LogCode_0xD00C(Packet packet)
        : _packet(packet)
    {
    }

    RecordList<TransportChannel> transportChannels() const
    {
        return {_packet, 17, 2, transportChannelCount()};
    }
    RecordList<CompositeChannel> compositeChannels() const
    {
        return {_packet, 289 + 34 * transportChannelCount(), 8, _packet.bits(14, 12, 4)};
    }

private:
    std::size_t transportChannelCount() const { return _packet.bits(14, 6, 6); }

    PacketReader _packet;
};

// "TRCH BLER": block error rates of the transport channels, one row dictionary each.
class TRCHBLERMeasurement final : public PacketSection<LogCode_0xD00C> {
public:
    TRCHBLERMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD00C& report) override;
};

// "CCTRCH SIR": signal-to-interference ratios of the coded composite transport channels, one row dictionary
// each.
class CCTRCHSIRMeasurement final : public PacketSection<LogCode_0xD00C> {
public:
    CCTRCHSIRMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD00C& report) override;
};

} // namespace orvex
