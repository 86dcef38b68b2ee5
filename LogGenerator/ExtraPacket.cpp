#include "ExtraPacket.h"

#include <algorithm>

namespace orvex {

const PropertyListResult& propertyListOf(Packet packet)
{
    struct Last {
        Bytes bytes;
        PropertyListResult list;
        bool isRead = false;
    };
    thread_local Last last;
    const auto bytes = PacketReader(packet).from(kPacketHeaderLength).bytes();
    if (!last.isRead || !std::ranges::equal(bytes, last.bytes)) {
        last.list = propertyListFromData(bytes);
        last.bytes.assign(bytes.begin(), bytes.end());
        last.isRead = true;
    }
    return last.list;
}

} // namespace orvex
