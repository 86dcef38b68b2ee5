#include "LTE/ConnectedModeMeasurementMisc.h"

namespace orvex {

ConnectedModeMeasurementMisc::ConnectedModeMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Connected mode LTE Intra-frequency Measurement", dict, codeDict)
{
}

void ConnectedModeMeasurementMisc::update(const LogCode_0xB179& report)
{
    Rows row = rows();
    row.print("E-ARFCN", "%d", report.earfcn());
    row.print("Serving Physical Cell ID", "%d", report.servingPhysicalCellIdentity());
    row.print("Subframe Number", "%d", report.subframeNumber());
    row.print("Serving Filtered RSRP", "%4.2f dBm", report.servingFilteredRSRP());
    row.print("Serving Filtered RSRQ", "%4.2f dB", report.servingFilteredRSRQ());
}

} // namespace orvex
