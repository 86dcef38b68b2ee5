#include "RawMessages.h"

#include "MessageFrame.h"

namespace orvex {

std::optional<ByteView> RawMessages::next()
{
    const std::size_t prefix =
        !_rest.empty() && _rest[0] == MessageFrame::kPrefixMark ? MessageFrame::kPrefixLength : 0;
    const std::size_t length = prefix + 1 + PacketReader(_rest).u16(prefix + 1);
    if (length < prefix + kPacketHeaderLength || length > _rest.size())
        return std::nullopt;
    const ByteView message = _rest.first(length);
    _rest = _rest.subspan(length);
    return message;
}

} // namespace orvex
