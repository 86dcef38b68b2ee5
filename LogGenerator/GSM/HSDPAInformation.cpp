#include "GSM/HSDPAInformation.h"

#include "EnumTable.h"

namespace orvex {

namespace {

constexpr EnumText kCarrierConfigurations[] = {
    {0, "Single Carrier"}, {1, "MIMO"}, {2, "Dual Carrier"}, {3, "Reserved"}};

void printRecord(RowWriter& row, const LogCode_0x4221::Process& process)
{
    row.setText("Process ID", "%u", process.identity());
    row.setText("No Rx Bits", "%u", process.receivedBits());
    row.setText("New Tx", "%u", process.newTransmissions());
    row.setText("Block Errors", "%u", process.blockErrors());
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
        row.set("Primary HARQ Process", listOf(report.primaryProcesses(), printRecord));
    if (report.secondaryProcesses().count() > 0)
        row.set("Secondary HARQ Process", listOf(report.secondaryProcesses(), printRecord));
}

} // namespace orvex
