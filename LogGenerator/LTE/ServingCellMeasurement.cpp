#include "LTE/ServingCellMeasurement.h"

namespace orvex {

namespace {

void printPower(RowWriter& row, const char* name, int raw)
{
    if (raw == LogCode_0xB17F::kNoPower)
        row.setText(name, "Not Present");
    else
        row.setText(name, "%d dBm", raw - 30);
}

void printSearch(RowWriter& row, const char* name, int raw, const char* unit)
{
    if (raw == LogCode_0xB17F::kNoSearch)
        row.setText(name, "Not Present");
    else
        row.setText(name, "%d %s", 2 * raw, unit);
}

} // namespace

ServingCellMeasurement::ServingCellMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Serving Cell Measurements", dict, codeDict)
{
}

void ServingCellMeasurement::update(const LogCode_0xB17F& report)
{
    RowWriter row = rows();
    row.setText("Version", "%d", report.version());
    row.setText("E-ARFCN", "%d", report.earfcn());
    row.setText("Physical Cell ID", "%d", report.physicalCellIdentity());
    row.setText("Serving Layer Priority", "%d", report.servingLayerPriority());
    row.setText("Measured RSRP", "%4.2f dBm", report.measuredRSRP());
    row.setText("Average RSRP", "%4.2f dBm", report.averageRSRP());
    row.setText("Measured RSRQ", "%4.2f dB", report.measuredRSRQ());
    row.setText("Average RSRQ", "%4.2f dB", report.averageRSRQ());
    row.setText("Measured RSSI", "%4.2f dBm", report.measuredRSSI());
    row.setText("Qrxlevmin", "%d dBm", report.qRxLevMin());
    printPower(row, "P_Max", report.pMax());
    // This field has 6 bits, so it never reaches the value that stands for none.
    printPower(row, "Max UE Tx Power", report.maximumTransmitPower());
    row.setText("Srxlev", "%d dBm", report.srxlev());
    row.setText("Num of Consecutive DRX Cycles of S < 0", "%d", report.drxCyclesBelowZero());
    printSearch(row, "S Intra Search", report.sIntraSearch(), "dB");
    printSearch(row, "S Non Intra Search", report.sNonIntraSearch(), "dBm"); // shown so, though it is dB
    row.setText("Measurement Rules Updated", report.measurementRulesUpdated() ? "True" : "False");
    row.setText("Measurement Rules", "%d", report.measurementRules());
}

} // namespace orvex
