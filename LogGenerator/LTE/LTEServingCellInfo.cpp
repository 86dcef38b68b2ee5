#include "LTE/LTEServingCellInfo.h"

#include "CellMonitorList.h"
#include "EnumTable.h"
#include "LTE/LogCode_0xB0C1.h"
#include "LTE/LogCode_0xB0C2.h"

#include "SystemLog.h"
#include "TelephonyConstants.h"

#include <algorithm>

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
    : Base("Serving Cell Info", {LogCode_0xB0C2::kCode, LogCode_0xB0C1::kCode, kExtraCodeCellMonitorList},
        dict, codeDict)
{
}

void LTEServingCellInfo::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "LTE Serving Cell Info");
    switch (logCode) {
    case LogCode_0xB0C1::kCode: return updateFromAntennas(packet);
    case LogCode_0xB0C2::kCode: return updateFromServingCell(packet);
    case kExtraCodeCellMonitorList: return updateFromCellMonitorList(packet);
    default: return reportUnknown(logCode);
    }
}

void LTEServingCellInfo::updateFromAntennas(Packet packet) const
{
    if (packet.size() < LogCode_0xB0C1::kMinimumLength)
        return;
    rows().print("Num Tx Antennas", "%d", LogCode_0xB0C1(packet).transmitAntennas());
    // Decoded, and yet reported: the logs of this system have always had this line for every such packet,
    // and people's filters know it.
    reportUnknown(LogCode_0xB0C1::kCode);
}

void LTEServingCellInfo::updateFromServingCell(Packet packet) const
{
    if (packet.size() < LogCode_0xB0C2::kMinimumLength)
        return;
    const LogCode_0xB0C2 cell(packet);
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

void LTEServingCellInfo::updateFromCellMonitorList(Packet packet) const
{
    const auto cells = CellMonitorList::read(packet);
    if (!cells) {
        systemLog(Priority::error, "Failed to get Cell Array\n");
        return;
    }
    const auto serving = std::ranges::find_if(*cells,
        [](const CellRecord& cell) { return cell.is(telephony::kRadioLTE, telephony::kCellTypeServing); });
    if (serving == cells->end())
        return;
    Rows row = rows();
    printServingCell(row, *serving, kCellEntries);
}

} // namespace orvex
