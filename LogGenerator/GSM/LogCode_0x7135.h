#pragma once

#include "PacketReader.h"

#include <array>

namespace orvex {

// The network that serves the handset.
//
//   13  u8    network operating mode
//   14  u8    service type
//   15  3     PLMN identity, a decimal digit a half byte (3GPP TS 24.008, 10.5.1.3)
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

} // namespace orvex
