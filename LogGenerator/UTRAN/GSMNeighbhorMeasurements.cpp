#include "UTRAN/GSMNeighbhorMeasurements.h"

namespace orvex {

namespace {

void printRecord(RowWriter& row, const LogCode_0xD00E::GSMNeighbor& neighbor)
{
    row.setText("Cell ID", "%d", neighbor.cellIdentity());
    row.setText("Band Indicator", "%d", neighbor.bandIndicator());
    row.setText("BSIC Valid", "%d", neighbor.bsicValid());
    row.setText("NCC", "%d", neighbor.ncc());
    row.setText("BCC", "%d", neighbor.bcc());
    row.setText("ARFCN", "%d", neighbor.arfcn());
    row.setText("RSSI", "%d", neighbor.rssi());
}

} // namespace

GSMNeighbhorMeasurements::GSMNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("GSM Neighbor Cell List", {Priority::warning, "GSM Neighbor Cell List"},
        OtherCodes::areIgnored, dict, codeDict)
{
}

void GSMNeighbhorMeasurements::update(const LogCode_0xD00E& report)
{
    clearElementsInArray(array());
    RowList nowhere(nullptr); // the list on screen has always been empty
    for (const auto& neighbor : report.neighbors())
        printRecord(nowhere.next(), neighbor);
}

} // namespace orvex
