#include "GSM/BLER.h"

namespace orvex {

namespace {

void printRecord(Rows& row, const LogCode_0x4116::TransportChannel& channel)
{
    row.print("Transport Channel ID", "%d", channel.identity());
    row.print("CRC Received", "%d", channel.received());
    row.print("CRC Received in Error", "%d", channel.receivedInError());
}

} // namespace

BLER::BLER(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("BLER", dict, codeDict)
{
}

void BLER::update(const LogCode_0x4116& report)
{
    Rows row = rows();
    row.print("Window Size", "%d", report.windowSize());
    row.set("Transport Channels", listOf(report.transportChannels(), printRecord));
}

} // namespace orvex
