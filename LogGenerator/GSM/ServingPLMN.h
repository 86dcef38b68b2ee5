#pragma once

#include "CellMonitorList.h"
#include "GSM/MobilityManagement.h"
#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

#include <array>

namespace orvex {

// The network that serves the handset.
//
//   13  u8    network operating mode
//   14  u8    service type
//   15  3     PLMN identity, one decimal digit per half byte (3GPP TS 24.008, 10.5.1.3)
//   18  u16   location area code, big-endian as on the air
//   20  u8    routing area code
class LogCode_0x7135 {
public:
    static constexpr LogCode kCode = 0x7135;
    static constexpr std::size_t kMinimumLength = 32;

    using Digits = std::array<char, 3>;

    explicit LogCode_0x7135(Packet packet)
        : _packet(packet)
    {
    }

    int networkOperatingMode() const { return _packet.u8(13); }
    int serviceType() const { return _packet.u8(14); }
    Digits mobileCountryCode() const { return {lowDigit(15), highDigit(15), lowDigit(16)}; }
    // The last character is a blank when the code has two digits.
    Digits mobileNetworkCode() const { return {lowDigit(17), highDigit(17), highDigit(16)}; }
    int locationAreaCode() const { return _packet.u8(18) << 8 | _packet.u8(19); }
    int routingAreaCode() const { return _packet.u8(20); }

private:
    // A half byte that is no digit is a blank.
    static char digit(int halfByte) { return static_cast<char>(halfByte < 10 ? '0' + halfByte : ' '); }
    char lowDigit(std::size_t offset) const { return digit(_packet.u8(offset) & 0x0F); }
    char highDigit(std::size_t offset) const { return digit(_packet.u8(offset) >> 4); }

    PacketReader _packet;
};

// "Serving PLMN": the network that serves the handset, from the baseband and from the telephony service's
// cell-monitor list. A row that both have shows whichever came last: network code 01 is "01 " from the
// baseband, digit by digit, and "1" from the list, a number.
class ServingPLMN final : public PacketSection<LogCode_0x7135, LogCode_0x7132, CellMonitorList> {
public:
    ServingPLMN(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7135& report) override;
    void update(const LogCode_0x7132& report) override;
    void update(const CellMonitorList& list) override;
};

// Equivalent PLMNs.
//
//   16     u8  number of PLMNs
//   17+3i      PLMN i
//
// A PLMN takes 6 bytes but begins 3 bytes after the previous one: each shares half its digits with the next.
class LogCode_0x7150 {
public:
    static constexpr LogCode kCode = 0x7150;
    static constexpr std::size_t kMinimumLength = 17;

    // One decimal digit per byte.
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

// "Equivalent PLMN List": the networks that count as the serving one, one row dictionary each.
class EquivalentPLMNList final : public PacketSection<LogCode_0x7150> {
public:
    EquivalentPLMNList(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7150& report) override;
};

} // namespace orvex
