#pragma once

#include "MessagePort.h"

#include <cstddef>
#include <deque>

namespace orvex {

// The raw packets of one refresh interval, in order of arrival. All are kept as long as they fit into the
// limit; beyond it the oldest go, whole packets, an eighth of the limit or so at a time, and the system log
// says so once for each interval. What is kept always begins with a packet.
class RawPackets {
public:
    // Far more than a modem sends between two refreshes.
    static constexpr std::size_t kLimit = std::size_t{64} << 20;

    // A limit of 0 keeps nothing, without a word.
    explicit RawPackets(std::size_t limit)
        : _limit(limit)
    {
    }

    void append(ByteView packet);
    std::size_t size() const { return _size; }
    // Bytes of packets that did not fit, in all intervals.
    std::size_t droppedBytes() const { return _droppedBytes; }
    // The packets back to back. The next interval begins.
    BytesRef take();

private:
    void makeRoomFor(std::size_t length);
    Bytes& batchWithRoomFor(std::size_t length);

    std::size_t _limit;
    std::deque<BytesRef> _batches; // each begins with a packet
    std::size_t _size = 0;         // of all batches
    std::size_t _expectedSize = 0; // one interval is much like the next
    std::size_t _droppedBytes = 0;
    bool _hasDropped = false; // in this interval
};

} // namespace orvex
