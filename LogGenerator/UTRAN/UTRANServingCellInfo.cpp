#include "UTRAN/UTRANServingCellInfo.h"

#include "TelephonyConstants.h"

namespace orvex {

namespace {

// The list has one UARFCN; it goes to both rows, over the two that the baseband tells apart.
constexpr CellEntry kCellEntries[] = {
    {telephony::kCellLAC, "Local Area Code", "LAC"},
    {telephony::kCellID, "Cell ID", "Cell ID"},
    {telephony::kCellBandInfo, "Freq Band Indicator", "Freq Band Indicator"},
    {telephony::kCellScramblingCode, "Cell Scrambling Code", "Cell Scrambling Code"},
    {.key = telephony::kCellUARFCN,
        .row = "Uplink UARFCN",
        .nameInMessage = "UARFCN",
        .otherRow = "Downlink UARFCN"},
};

} // namespace

UTRANServingCellInfo::UTRANServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(
        "Serving Cell Info", {Priority::warning, "Serving Cell Info"}, OtherCodes::areIgnored, dict, codeDict)
{
}

void UTRANServingCellInfo::update(const LogCode_0xD0E2& cell)
{
    RowWriter row = rows();
    row.setText("Cell Access Restrictions", "%d", cell.cellAccessRestrictions());
    row.setText("Cell ID", "%d", cell.cellIdentity());
    row.setText("Downlink UARFCN", "%d", cell.downlinkUARFCN());
    row.setText("Uplink UARFCN", "%d", cell.uplinkUARFCN());
    row.setText("URA ID", "%d", cell.uraIdentity());
    row.setText("Allowed Access", cell.isBarred() ? "Emergency Calls Only" : "All Calls");
}

void UTRANServingCellInfo::update(const CellMonitorList& list)
{
    RowWriter row = rows();
    for (const CellRecord& cell : list.findAll(telephony::kRadioUTRAN, telephony::kCellTypeServing))
        printCell(row, cell, kCellEntries, "Serving Cell Info"); // of several, the last one wins
}

} // namespace orvex
