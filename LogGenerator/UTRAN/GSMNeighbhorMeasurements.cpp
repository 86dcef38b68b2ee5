#include "UTRAN/GSMNeighbhorMeasurements.h"

namespace orvex {

namespace {

DictionaryRef rowsOf(const LogCode_0xD00E::GSMNeighbor& neighbor)
{
    Rows row = Rows::make();
    row.print("Cell ID", "%d", neighbor.cellIdentity());
    row.print("Band Indicator", "%d", neighbor.bandIndicator());
    row.print("BSIC Valid", "%d", neighbor.bsicValid());
    row.print("NCC", "%d", neighbor.ncc());
    row.print("BCC", "%d", neighbor.bcc());
    row.print("ARFCN", "%d", neighbor.arfcn());
    row.print("RSSI", "%d", neighbor.rssi());
    return row.dictionary();
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
    Array cells;
    for (const auto& neighbor : report.neighbors())
        cells.append(rowsOf(neighbor));
    // Not published: what one sees here has always been an empty list.
}

} // namespace orvex
