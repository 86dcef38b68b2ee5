#include "LTE/ConnectedModeMeasurementMisc.h"

#include "LTE/LogCode_0xB179.h"

#include "SystemLog.h"

namespace orvex {

ConnectedModeMeasurementMisc::ConnectedModeMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("Connected mode LTE Intra-frequency Measurement", {LogCode_0xB179::kCode}, dict, codeDict)
{
}

void ConnectedModeMeasurementMisc::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "%s", getSectionName().c_str());
    if (logCode != LogCode_0xB179::kCode)
        return reportUnknown(logCode);
    if (packet.size() < LogCode_0xB179::kMinimumLength)
        return;
    const LogCode_0xB179 measurement(packet);
    Rows row = rows();
    row.print("E-ARFCN", "%d", measurement.earfcn());
    row.print("Serving Physical Cell ID", "%d", measurement.servingPhysicalCellIdentity());
    row.print("Subframe Number", "%d", measurement.subframeNumber());
    row.print("Serving Filtered RSRP", "%4.2f dBm", measurement.servingFilteredRSRP());
    row.print("Serving Filtered RSRQ", "%4.2f dB", measurement.servingFilteredRSRQ());
}

} // namespace orvex
