#include "LTE/NeighborMeasurementMisc.h"

namespace orvex {

NeighborMeasurementMisc::NeighborMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Neighbor Measurements", dict, codeDict)
{
}

void NeighborMeasurementMisc::update(const LogCode_0xB180& report)
{
    RowWriter row = rows();
    row.setText("Version", "%d", report.version());
    row.setText("E-ARFCN", "%d", report.earfcn());
    row.setText("Qrxlevmin", "%d dBm", report.qRxLevMin());
}

} // namespace orvex
