#pragma once

#include "PacketReader.h"

namespace orvex {

// The frame of a message on the log channel: at least as long as a packet header, with a two-byte prefix
// before the packet if the first byte is 0x81. The check counts the prefix, so a prefixed packet may be two
// bytes shorter than its header.
class MessageFrame {
public:
    static constexpr std::uint8_t kTypeBaseband = 1;
    static constexpr std::uint8_t kTypeExtra = 255;
    // First byte of a prefix, and its length.
    static constexpr std::uint8_t kPrefixMark = 0x81;
    static constexpr std::size_t kPrefixLength = 2;

    explicit MessageFrame(ByteView message)
        : _isComplete(message.size() >= kPacketHeaderLength)
        , _packet(_isComplete && message[0] == kPrefixMark ? message.subspan(kPrefixLength) : message)
    {
    }

    // False if the message is too short to be read.
    bool isComplete() const { return _isComplete; }
    Packet packet() const { return _packet.bytes(); }
    std::uint8_t logType() const { return _packet.u8(0); }
    LogCode logCode() const { return _packet.u16(3) | (logType() == kTypeExtra ? kExtraCodeBase : 0); }

private:
    bool _isComplete;
    PacketReader _packet;
};

} // namespace orvex
