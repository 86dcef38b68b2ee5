#include "LTE/ConnectedModeMeasurementMisc.h"

namespace orvex {

ConnectedModeMeasurementMisc::ConnectedModeMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Connected mode LTE Intra-frequency Measurement", dict, codeDict)
{
}

void ConnectedModeMeasurementMisc::update(const LogCode_0xB179& report)
{
    RowWriter row = rows();
    row.setText("E-ARFCN", "%d", report.earfcn());
    row.setText("Serving Physical Cell ID", "%d", report.servingPhysicalCellIdentity());
    row.setText("Subframe Number", "%d", report.subframeNumber());
    row.setText("Serving Filtered RSRP", "%4.2f dBm", report.servingFilteredRSRP());
    row.setText("Serving Filtered RSRQ", "%4.2f dB", report.servingFilteredRSRQ());
}

} // namespace orvex
