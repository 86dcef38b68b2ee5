#include "UTRAN/UTRANServingCellInfo.h"

#include "CellMonitorList.h"
#include "UTRAN/LogCode_0xD0E2.h"

#include "SystemLog.h"
#include "TelephonyConstants.h"

namespace orvex {

namespace {

// The list has one UARFCN; it goes to both rows, over the two that the baseband tells apart.
constexpr CellEntry kCellEntries[] = {
    {telephony::kCellLAC, "Local Area Code", "LAC"},
    {telephony::kCellID, "Cell ID", "Cell ID"},
    {telephony::kCellBandInfo, "Freq Band Indicator", "Freq Band Indicator"},
    {telephony::kCellScramblingCode, "Cell Scrambling Code", "Cell Scrambling Code"},
    {telephony::kCellUARFCN, "Uplink UARFCN", "UARFCN", "Downlink UARFCN"},
};

} // namespace

UTRANServingCellInfo::UTRANServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("Serving Cell Info", {LogCode_0xD0E2::kCode, kExtraCodeCellMonitorList}, dict, codeDict)
{
}

void UTRANServingCellInfo::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "Serving Cell Info");
    if (logCode == LogCode_0xD0E2::kCode)
        updateFromServingCell(packet);
    else if (logCode == kExtraCodeCellMonitorList)
        updateFromCellMonitorList(packet);
}

void UTRANServingCellInfo::updateFromServingCell(Packet packet) const
{
    if (packet.size() < LogCode_0xD0E2::kMinimumLength)
        return;
    const LogCode_0xD0E2 cell(packet);
    Rows row = rows();
    row.print("Cell Access Restrictions", "%d", cell.cellAccessRestrictions());
    row.print("Cell ID", "%d", cell.cellIdentity());
    row.print("Downlink UARFCN", "%d", cell.downlinkUARFCN());
    row.print("Uplink UARFCN", "%d", cell.uplinkUARFCN());
    row.print("URA ID", "%d", cell.uraIdentity());
    row.set("Allowed Access", cell.isBarred() ? "Emergency Calls Only" : "All Calls");
}

void UTRANServingCellInfo::updateFromCellMonitorList(Packet packet) const
{
    const auto cells = CellMonitorList::read(packet);
    if (!cells)
        return;
    Rows row = rows();
    for (const CellRecord& cell : *cells) {
        if (cell.is(telephony::kRadioUTRAN, telephony::kCellTypeServing))
            printServingCell(row, cell, kCellEntries); // of several, the last one wins
    }
}

} // namespace orvex
