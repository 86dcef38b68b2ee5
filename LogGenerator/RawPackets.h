#pragma once

#include "MessagePort.h"

#include <cstddef>
#include <deque>

namespace orvex {

// The raw packets of one refresh interval, in order of arrival. All are kept while they fit within the
// limit. Beyond it the oldest are dropped, whole packets, about an eighth of the limit at a time, with one
// log line per interval. What is kept always begins with a whole packet.
class RawPackets {
public:
    // Far more than a modem sends between two refreshes.
    static constexpr std::size_t kLimit = std::size_t{64} << 20;

    // A limit of 0 keeps nothing and logs nothing.
    explicit RawPackets(std::size_t limit)
        : _limit(limit)
    {
    }

    void append(ByteView packet);
    std::size_t size() const { return _size; }
    // Bytes of packets that did not fit, in all intervals.
    std::size_t droppedBytes() const { return _droppedBytes; }
    // Returns the packets back to back and begins the next interval.
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
