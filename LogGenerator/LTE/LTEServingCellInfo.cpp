#include "LTE/LTEServingCellInfo.h"

#include "EnumTable.h"

#include "TelephonyConstants.h"

namespace orvex {

namespace {

// Resource blocks to channel bandwidth, 3GPP TS 36.101, table 5.6-1.
constexpr EnumText kBandwidths[] = {
    {6, "1.4 MHz"}, {15, "3 MHz"}, {25, "5 MHz"}, {50, "10 MHz"}, {75, "15 MHz"}, {100, "20 MHz"}};

const char* bandwidthText(int resourceBlocks)
{
    return textFor(resourceBlocks, kBandwidths, "Unknown");
}

constexpr CellEntry kCellEntries[] = {
    {telephony::kCellTAC, "Tracking Area Code", "TAC"},
    {telephony::kCellID, "Cell Identity", "Cell ID"},
    {telephony::kCellPhysicalCellID, "Physical Cell ID", "Physical Cell ID"},
    {telephony::kCellBandInfo, "Freq Band Indicator", "Freq Band Indicator"},
    {telephony::kCellUARFCN, "UARFCN", "UARFCN"},
};

} // namespace

LTEServingCellInfo::LTEServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Serving Cell Info", "LTE Serving Cell Info", dict, codeDict)
{
}

void LTEServingCellInfo::update(const LogCode_0xB0C1& antennas)
{
    rows().print("Num Tx Antennas", "%d", antennas.transmitAntennas());
    // Decoded, and yet reported: the logs of this system have always had this line for every such packet,
    // and people's filters know it.
    reportUnknown(LogCode_0xB0C1::kCode);
}

void LTEServingCellInfo::update(const LogCode_0xB0C2& cell)
{
    Rows row = rows();
    row.print("Physical Cell ID", "%d", cell.physicalCellIdentity());
    row.print("Download Frequency", "%d", cell.downlinkFrequency());
    row.print("Upload Frequency", "%d", cell.uplinkFrequency());
    row.remove("UARFCN"); // the cell-monitor list's; it is of the cell before
    row.set("Download Bandwidth", bandwidthText(cell.downlinkBandwidth()));
    row.set("Upload Bandwidth", bandwidthText(cell.uplinkBandwidth()));
    row.print("Cell Identity", "%d", cell.cellIdentity());
    row.print("Tracking Area Code", "%d", cell.trackingAreaCode());
    row.print("Freq Band Indicator", "%d", cell.frequencyBandIndicator());
}

void LTEServingCellInfo::update(const CellMonitorList& list)
{
    list.reportIfAbsent();
    Rows row = rows();
    if (const CellRecord* cell = list.find({telephony::kRadioLTE}, telephony::kCellTypeServing))
        printCell(row, *cell, kCellEntries, "Serving Cell Info");
}

} // namespace orvex
