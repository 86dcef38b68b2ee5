#include "GSM/BLER.h"

namespace orvex {

namespace {

void printRecord(RowWriter& row, const LogCode_0x4116::TransportChannel& channel)
{
    row.setText("Transport Channel ID", "%d", channel.identity());
    row.setText("CRC Received", "%d", channel.received());
    row.setText("CRC Received in Error", "%d", channel.receivedInError());
}

} // namespace

BLER::BLER(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("BLER", dict, codeDict)
{
}

void BLER::update(const LogCode_0x4116& report)
{
    RowWriter row = rows();
    row.setText("Window Size", "%d", report.windowSize());
    row.set("Transport Channels", listOf(report.transportChannels(), printRecord));
}

} // namespace orvex
