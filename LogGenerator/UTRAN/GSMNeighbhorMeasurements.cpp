#include "UTRAN/GSMNeighbhorMeasurements.h"

#include "UTRAN/LogCode_0xD00E.h"

#include "SystemLog.h"

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
    : Base("GSM Neighbor Cell List", {LogCode_0xD00E::kCode}, dict, codeDict)
{
}

void GSMNeighbhorMeasurements::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "GSM Neighbor Cell List");
    if (logCode != LogCode_0xD00E::kCode || packet.size() < LogCode_0xD00E::kMinimumLength)
        return;
    clearSection();
    Array cells;
    for (const auto& neighbor : LogCode_0xD00E(packet).neighbors())
        cells.append(rowsOf(neighbor));
    // Not published: what one sees here has always been an empty list.
}

} // namespace orvex
