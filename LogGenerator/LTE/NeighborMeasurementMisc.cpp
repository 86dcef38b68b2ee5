#include "LTE/NeighborMeasurementMisc.h"

namespace orvex {

NeighborMeasurementMisc::NeighborMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Neighbor Measurements", dict, codeDict)
{
}

void NeighborMeasurementMisc::update(const LogCode_0xB180& report)
{
    Rows row = rows();
    row.print("Version", "%d", report.version());
    row.print("E-ARFCN", "%d", report.earfcn());
    row.print("Qrxlevmin", "%d dBm", report.qRxLevMin());
}

} // namespace orvex
