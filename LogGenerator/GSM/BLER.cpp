#include "GSM/BLER.h"

namespace orvex {

BLER::BLER(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("BLER", dict, codeDict)
{
}

void BLER::update(const LogCode_0x4116& report)
{
    RowWriter row = rows();
    row.setText("Window Size", "%d", report.windowSize());
    RowList channels(row.list("Transport Channels"));
    for (const auto& channel : report.transportChannels()) {
        RowWriter& record = channels.next();
        record.setText("Transport Channel ID", "%d", channel.identity());
        record.setText("CRC Received", "%d", channel.received());
        record.setText("CRC Received in Error", "%d", channel.receivedInError());
    }
}

} // namespace orvex
