#pragma once

#include "PacketReader.h"
#include "RecordList.h"

namespace orvex {

// Equivalent PLMNs.
//
//   16     u8  number of PLMNs
//   17+3i      PLMN i
//
// A PLMN takes 6 bytes and yet begins 3 bytes after the one before: each shares half its digits with the
// next.
class LogCode_0x7150 {
public:
    static constexpr LogCode kCode = 0x7150;
    static constexpr std::size_t kMinimumLength = 17;

    // A decimal digit a byte.
    //
    //   0, 2, 4  u8  country code
    //   1, 3, 5  u8  network code
    class PLMN {
    public:
        explicit PLMN(PacketReader record)
            : _record(record)
        {
        }

        int mobileCountryCode() const { return number(0); }
        int mobileNetworkCode() const { return number(1); }

    private:
        int number(std::size_t first) const
        {
            return 100 * _record.u8(first) + 10 * _record.u8(first + 2) + _record.u8(first + 4);
        }

        PacketReader _record;
    };

    explicit LogCode_0x7150(Packet packet)
        : _packet(packet)
    {
    }

    RecordList<PLMN> plmns() const { return {_packet, 17, 3, _packet.u8(16), 6}; }

private:
    PacketReader _packet;
};

} // namespace orvex
