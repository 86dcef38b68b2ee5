#include "LTE/ServingCellMeasurement.h"

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
    : PacketSection("Serving Cell Measurements", dict, codeDict)
{
}

void ServingCellMeasurement::update(const LogCode_0xB17F& report)
{
    Rows row = rows();
    row.print("Version", "%d", report.version());
    row.print("E-ARFCN", "%d", report.earfcn());
    row.print("Physical Cell ID", "%d", report.physicalCellIdentity());
    row.print("Serving Layer Priority", "%d", report.servingLayerPriority());
    row.print("Measured RSRP", "%4.2f dBm", report.measuredRSRP());
    row.print("Average RSRP", "%4.2f dBm", report.averageRSRP());
    row.print("Measured RSRQ", "%4.2f dB", report.measuredRSRQ());
    row.print("Average RSRQ", "%4.2f dB", report.averageRSRQ());
    row.print("Measured RSSI", "%4.2f dBm", report.measuredRSSI());
    row.print("Qrxlevmin", "%d dBm", report.qRxLevMin());
    printPower(row, "P_Max", report.pMax());
    // The field has 6 bits and never reaches the value that stands for none; the test is the same all the
    // same.
    printPower(row, "Max UE Tx Power", report.maximumTransmitPower());
    row.print("Srxlev", "%d dBm", report.srxlev());
    row.print("Num of Consecutive DRX Cycles of S < 0", "%d", report.drxCyclesBelowZero());
    printSearch(row, "S Intra Search", report.sIntraSearch(), "dB");
    printSearch(row, "S Non Intra Search", report.sNonIntraSearch(), "dBm"); // shown so, though it is dB
    row.set("Measurement Rules Updated", report.measurementRulesUpdated() ? "True" : "False");
    row.print("Measurement Rules", "%d", report.measurementRules());
}

} // namespace orvex
