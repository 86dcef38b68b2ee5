#include "UTRAN/GSMNeighbhorMeasurements.h"

namespace orvex {

namespace {

void printRecord(Rows& row, const LogCode_0xD00E::GSMNeighbor& neighbor)
{
    row.print("Cell ID", "%d", neighbor.cellIdentity());
    row.print("Band Indicator", "%d", neighbor.bandIndicator());
    row.print("BSIC Valid", "%d", neighbor.bsicValid());
    row.print("NCC", "%d", neighbor.ncc());
    row.print("BCC", "%d", neighbor.bcc());
    row.print("ARFCN", "%d", neighbor.arfcn());
    row.print("RSSI", "%d", neighbor.rssi());
}

} // namespace

GSMNeighbhorMeasurements::GSMNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("GSM Neighbor Cell List", {Priority::warning, "GSM Neighbor Cell List"},
        OtherCodes::areIgnored, dict, codeDict)
{
}

void GSMNeighbhorMeasurements::update(const LogCode_0xD00E& report)
{
    clearSection();
    RowList nowhere(nullptr); // the list on screen has always been empty
    for (const auto& neighbor : report.neighbors())
        printRecord(nowhere.next(), neighbor);
}

} // namespace orvex
