#include "PacketKinds.h"

#include "MessageFrame.h"

#include <algorithm>
#include <string_view>

namespace orvex {

namespace {

bool isPropertyList(ByteView message)
{
    static constexpr std::string_view kBinary = "bplist";
    return !message.empty()
        && (message[0] == '<'
            || (message.size() >= kBinary.size()
                && std::ranges::equal(message.first(kBinary.size()), kBinary)));
}

} // namespace

LogCode codeOfMessage(ByteView message)
{
    if (isPropertyList(message))
        return kCodeOfPropertyList;
    const MessageFrame frame(message);
    const bool isPacket =
        frame.logType() == MessageFrame::kTypeBaseband || frame.logType() == MessageFrame::kTypeExtra;
    return frame.isComplete() && isPacket ? frame.logCode() : kCodeOfNoPacket;
}

const PacketKind* PacketKinds::find(LogCode code) const
{
    const auto found = std::ranges::find(_kinds, code, &PacketKind::code);
    return found == _kinds.end() ? nullptr : &*found;
}

} // namespace orvex
