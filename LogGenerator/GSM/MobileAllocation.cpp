#include "GSM/MobileAllocation.h"

namespace orvex {

MobileAllocation::MobileAllocation(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Mobile Allocation", "MobileAllocation", dict, codeDict)
{
}

void MobileAllocation::update(const LogCode_0x51F8& report)
{
    RowWriter row = rows();
    row.setText("HSN", "%d", report.hoppingSequenceNumber());
    RowList channels(row.list("ARFCNs"));
    for (const auto& channel : report.channels())
        channels.append(DeferredText("%d", channel.arfcn()));
}

} // namespace orvex
