#include "PortFrame.h"

#include <algorithm>
#include <span>
#include <utility>

namespace orvex {

namespace {
void putU32(std::span<std::uint8_t, 4> bytes, std::uint32_t number)
{
    for (std::uint8_t& byte : bytes) {
        byte = static_cast<std::uint8_t>(number);
        number >>= 8;
    }
}

std::uint32_t u32(ByteView bytes, std::size_t position)
{
    std::uint32_t number = 0;
    for (std::size_t i = 4; i-- > 0;)
        number = number << 8 | bytes[position + i];
    return number;
}
} // namespace

Bytes encodedFrame(const Frame& frame)
{
    Bytes bytes;
    bytes.reserve(kFrameHeaderSize + frame.payload.size());
    bytes.resize(kFrameHeaderSize);
    const std::span<std::uint8_t, kFrameHeaderSize> header(bytes.data(), kFrameHeaderSize);
    putU32(header.subspan<0, 4>(), static_cast<std::uint32_t>(frame.payload.size()));
    putU32(header.subspan<4, 4>(), static_cast<std::uint32_t>(frame.messageId));
    putU32(header.subspan<8, 4>(), static_cast<std::uint32_t>(frame.kind));
    putU32(header.subspan<12, 4>(), frame.correlation);
    bytes.insert(bytes.end(), frame.payload.begin(), frame.payload.end());
    return bytes;
}

void FrameReader::append(ByteView bytes)
{
    // Moves the rest, usually an incomplete frame, once per read.
    _bytes.erase(_bytes.begin(), _bytes.begin() + static_cast<std::ptrdiff_t>(std::exchange(_taken, 0)));
    if (_bytes.size() >= kFrameHeaderSize) // exact, so that the buffer does not double
        _bytes.reserve(
            kFrameHeaderSize + std::min<std::size_t>(u32(_bytes, 0), kLargestPayload) + bytes.size());
    _bytes.insert(_bytes.end(), bytes.begin(), bytes.end());
}

std::optional<Frame> FrameReader::take()
{
    const ByteView rest = ByteView(_bytes).subspan(_taken);
    if (_fault || rest.size() < kFrameHeaderSize) {
        constexpr std::size_t kKeptCapacity = std::size_t{1} << 20;
        if (rest.empty() && _bytes.capacity() > kKeptCapacity) {
            Bytes().swap(_bytes); // frees what an exceptionally long frame took
            _taken = 0;
        }
        return std::nullopt;
    }
    const std::size_t length = u32(rest, 0);
    const std::uint32_t kind = u32(rest, 8);
    if (length > kLargestPayload)
        _fault = "a payload of more than 16 MiB";
    else if (kind > static_cast<std::uint32_t>(FrameKind::reply))
        _fault = "a frame of unknown kind";
    if (_fault || rest.size() - kFrameHeaderSize < length)
        return std::nullopt;
    _taken += kFrameHeaderSize + length;
    return Frame{static_cast<std::int32_t>(u32(rest, 4)), static_cast<FrameKind>(kind), u32(rest, 12),
        rest.subspan(kFrameHeaderSize, length)};
}

} // namespace orvex
