#include "GSM/WCDMADownlink.h"

#include "EnumTable.h"

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

namespace {

constexpr EnumText kCarrierConfigurations[] = {
    {0, "Single Carrier"}, {1, "MIMO"}, {2, "Dual Carrier"}, {3, "Reserved"}};

void printProcesses(ArrayRef array, const RecordList<LogCode_0x4221::Process>& processes)
{
    RowList list(std::move(array));
    for (const auto& process : processes) {
        RowWriter& row = list.next();
        row.setText("Process ID", "%u", process.identity());
        row.setText("No Rx Bits", "%u", process.receivedBits());
        row.setText("New Tx", "%u", process.newTransmissions());
        row.setText("Block Errors", "%u", process.blockErrors());
    }
}

} // namespace

HSDPAInformation::HSDPAInformation(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("HSDPA Info", {Priority::warning, "HSDPA Info"}, OtherCodes::areIgnored, dict, codeDict)
{
}

void HSDPAInformation::update(const LogCode_0x4221& report)
{
    RowWriter row = rows();
    row.setText("Version", "%u", report.version());
    row.setText("Sub Frames", "%u", report.subframes());
    row.setText("Carrier Info", textFor(report.carrierConfiguration(), kCarrierConfigurations, ""));
    if (report.primaryProcesses().count() > 0)
        printProcesses(row.list("Primary HARQ Process"), report.primaryProcesses());
    if (report.secondaryProcesses().count() > 0)
        printProcesses(row.list("Secondary HARQ Process"), report.secondaryProcesses());
}

} // namespace orvex
