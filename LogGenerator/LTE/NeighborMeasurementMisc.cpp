#include "LTE/NeighborMeasurementMisc.h"

#include "LTE/LogCode_0xB180.h"

#include "SystemLog.h"

namespace orvex {

NeighborMeasurementMisc::NeighborMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("Neighbor Measurements", {LogCode_0xB180::kCode}, dict, codeDict)
{
}

void NeighborMeasurementMisc::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "%s", getSectionName().c_str());
    if (logCode != LogCode_0xB180::kCode)
        return reportUnknown(logCode);
    if (packet.size() < LogCode_0xB180::kMinimumLength)
        return;
    const LogCode_0xB180 measurement(packet);
    Rows row = rows();
    row.print("Version", "%d", measurement.version());
    row.print("E-ARFCN", "%d", measurement.earfcn());
    row.print("Qrxlevmin", "%d dBm", measurement.qRxLevMin());
}

} // namespace orvex
