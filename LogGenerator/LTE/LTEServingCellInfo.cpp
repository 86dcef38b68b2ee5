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

constexpr CellEntry kLTECellEntries[] = {
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
    rows().setText("Num Tx Antennas", "%d", antennas.transmitAntennas());
    // Decoded, yet reported: this line has always been logged for every such packet, and people's log
    // filters rely on it.
    reportUnknown(LogCode_0xB0C1::kCode);
}

void LTEServingCellInfo::update(const LogCode_0xB0C2& cell)
{
    RowWriter row = rows();
    row.setText("Physical Cell ID", "%d", cell.physicalCellIdentity());
    row.setText("Download Frequency", "%d", cell.downlinkFrequency());
    row.setText("Upload Frequency", "%d", cell.uplinkFrequency());
    row.remove("UARFCN"); // the cell-monitor list's; it belongs to the previous cell
    row.setText("Download Bandwidth", bandwidthText(cell.downlinkBandwidth()));
    row.setText("Upload Bandwidth", bandwidthText(cell.uplinkBandwidth()));
    row.setText("Cell Identity", "%d", cell.cellIdentity());
    row.setText("Tracking Area Code", "%d", cell.trackingAreaCode());
    row.setText("Freq Band Indicator", "%d", cell.frequencyBandIndicator());
}

void LTEServingCellInfo::update(const CellMonitorList& list)
{
    list.reportIfAbsent();
    RowWriter row = rows();
    if (const CellRecord* cell = list.find({telephony::kRadioLTE}, telephony::kCellTypeServing))
        printCell(row, *cell, kLTECellEntries, "Serving Cell Info");
}

} // namespace orvex
