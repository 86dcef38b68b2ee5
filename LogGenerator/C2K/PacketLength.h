#pragma once

#include "PacketReader.h"

#include "SystemLog.h"

namespace orvex {

// True when the packet has the least length that its reader asks for; otherwise says so.
template <typename Reader>
bool hasMinimumLength(Packet packet)
{
    if (packet.size() >= Reader::kMinimumLength)
        return true;
    systemLog(Priority::error, "Log code 0x%x is %u bytes long but must be at least %lu bytes.",
        static_cast<unsigned>(Reader::kCode), static_cast<unsigned>(packet.size()),
        static_cast<unsigned long>(Reader::kMinimumLength));
    return false;
}

} // namespace orvex
