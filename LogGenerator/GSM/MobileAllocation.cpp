#include "GSM/MobileAllocation.h"

#include "TextFormat.h"

namespace orvex {

MobileAllocation::MobileAllocation(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Mobile Allocation", "MobileAllocation", dict, codeDict)
{
}

void MobileAllocation::update(const LogCode_0x51F8& report)
{
    Rows row = rows();
    row.print("HSN", "%d", report.hoppingSequenceNumber());
    row.set(
        "ARFCNs", listOf(report.channels(), [](const auto& channel) { return text("%d", channel.arfcn()); }));
}

} // namespace orvex
