#include "ExtraPacket.h"

#include "PacketWriter.h"

#include "PropertyList.h"

#include <stdexcept>

namespace orvex::korat {

namespace {
LogMessage extraMessage(LogCode code, Microseconds time, const Value& content)
{
    const auto xml = propertyListXML(content);
    if (!xml)
        throw std::invalid_argument("an extra packet's content has no property-list form");
    PacketWriter packet(code, time, PacketWriter::kHeaderLength + xml->size());
    packet.copy(PacketWriter::kHeaderLength, *xml);
    return packet.take();
}
} // namespace

LogMessage simFilesMessage(Microseconds time, const DictionaryRef& files)
{
    return extraMessage(kSimFilesCode, time, files);
}

LogMessage cellMonitorMessage(Microseconds time, const ArrayRef& cells)
{
    return extraMessage(kCellMonitorCode, time, cells);
}

LogMessage pdpContextsMessage(Microseconds time, const ArrayRef& contexts)
{
    return extraMessage(kPDPContextsCode, time, contexts);
}

} // namespace orvex::korat
