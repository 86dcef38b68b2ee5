#include "LTE/ServingCellMeasurement.h"

#include "LTE/LogCode_0xB17F.h"

#include "SystemLog.h"

namespace orvex {

namespace {

void printPower(Rows& row, const char* name, int raw)
{
    if (raw == LogCode_0xB17F::kNoPower)
        row.set(name, "Not Present");
    else
        row.print(name, "%d dBm", raw - 30);
}

void printSearch(Rows& row, const char* name, int raw, const char* unit)
{
    if (raw == LogCode_0xB17F::kNoSearch)
        row.set(name, "Not Present");
    else
        row.print(name, "%d %s", 2 * raw, unit);
}

} // namespace

ServingCellMeasurement::ServingCellMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("Serving Cell Measurements", {LogCode_0xB17F::kCode}, dict, codeDict)
{
}

void ServingCellMeasurement::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "%s", getSectionName().c_str());
    if (logCode != LogCode_0xB17F::kCode)
        return reportUnknown(logCode);
    if (packet.size() < LogCode_0xB17F::kMinimumLength)
        return;
    const LogCode_0xB17F measurement(packet);
    Rows row = rows();
    row.print("Version", "%d", measurement.version());
    row.print("E-ARFCN", "%d", measurement.earfcn());
    row.print("Physical Cell ID", "%d", measurement.physicalCellIdentity());
    row.print("Serving Layer Priority", "%d", measurement.servingLayerPriority());
    row.print("Measured RSRP", "%4.2f dBm", measurement.measuredRSRP());
    row.print("Average RSRP", "%4.2f dBm", measurement.averageRSRP());
    row.print("Measured RSRQ", "%4.2f dB", measurement.measuredRSRQ());
    row.print("Average RSRQ", "%4.2f dB", measurement.averageRSRQ());
    row.print("Measured RSSI", "%4.2f dBm", measurement.measuredRSSI());
    row.print("Qrxlevmin", "%d dBm", measurement.qRxLevMin());
    printPower(row, "P_Max", measurement.pMax());
    // The field has 6 bits and never reaches the value that stands for none; the test is the same all the
    // same.
    printPower(row, "Max UE Tx Power", measurement.maximumTransmitPower());
    row.print("Srxlev", "%d dBm", measurement.srxlev());
    row.print("Num of Consecutive DRX Cycles of S < 0", "%d", measurement.drxCyclesBelowZero());
    printSearch(row, "S Intra Search", measurement.sIntraSearch(), "dB");
    printSearch(row, "S Non Intra Search", measurement.sNonIntraSearch(), "dBm"); // shown so, though it is dB
    row.set("Measurement Rules Updated", measurement.measurementRulesUpdated() ? "True" : "False");
    row.print("Measurement Rules", "%d", measurement.measurementRules());
}

} // namespace orvex
