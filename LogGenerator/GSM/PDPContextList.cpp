#include "GSM/PDPContextList.h"

#include "ExtraPacket.h"

#include "SystemLog.h"

namespace orvex {

PDPContextList::PDPContextList(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("PDP Context Info", {kExtraCodePDPContexts}, dict, codeDict)
{
}

void PDPContextList::updateWithData(Packet packet, LogCode)
{
    systemLog(Priority::warning, "PDPContextList");
    const PropertyListResult& list = propertyListOf(packet);
    if (!list.value)
        throw UnknownDataException("PDP context list: " + list.error);
    if (const ArrayRef contexts = list.value->array())
        replaceArray(array(), *contexts);
}

} // namespace orvex
