#pragma once

#include "Value.h"

#include <cstddef>
#include <cstdint>
#include <optional>

namespace orvex {

// The frames on the sockets of message ports, little-endian:
//
//    0  u32  length of the payload
//    4  i32  message id
//    8  u32  kind
//   12  u32  correlation number: chosen by the requester, echoed in the reply, 0 in one-way messages
//   16       payload
enum class FrameKind : std::uint32_t { oneWay = 0, request = 1, reply = 2 };

inline constexpr std::size_t kFrameHeaderSize = 16;
inline constexpr std::size_t kLargestPayload = std::size_t{16} << 20;

struct Frame {
    std::int32_t messageId = 0;
    FrameKind kind = FrameKind::oneWay;
    std::uint32_t correlation = 0;
    ByteView payload;
};

// A whole frame. The payload must not exceed kLargestPayload.
Bytes encodedFrame(const Frame& frame);

// Splits a byte stream into frames.
class FrameReader {
public:
    // Appends bytes of the stream. Like take(), invalidates payloads returned earlier.
    void append(ByteView bytes);

    // The next whole frame. None if it is incomplete or the stream is broken.
    std::optional<Frame> take();

    // Why a header was invalid, after which nothing more can be read. Null if there is no error.
    const char* fault() const { return _fault; }
    // True if the stream ends inside a frame.
    bool isInsideFrame() const { return partialBytes() > 0; }
    // Bytes waiting for the rest of their frame.
    std::size_t partialBytes() const { return _bytes.size() - _taken; }

private:
    Bytes _bytes;
    std::size_t _taken = 0; // bytes at the front already returned
    const char* _fault = nullptr;
};

} // namespace orvex
