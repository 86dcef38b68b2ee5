#include "LogCode_0xFF0000.h"

#include "ExtraPacket.h"

#include "SystemLog.h"

namespace orvex {

DictionaryRef LogCode_0xFF0000::files() const
{
    const PropertyListResult& list = propertyListOf(_packet.bytes());
    if (auto files = list.value ? list.value->dictionary() : nullptr)
        return files;
    systemLog(Priority::error, "SIM File dictionary data could not be constructed");
    throw UnknownDataException();
}

} // namespace orvex
