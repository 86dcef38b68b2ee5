#include "GSM/GPRSInformation.h"

#include "EnumTable.h"

namespace orvex {

namespace {

constexpr EnumText kNetworkOperatingModes[] = {{0, "Class 1"}, {1, "Class 2"}, {2, "Class 3"}};

constexpr EnumText kNetworkControlOrders[] = {{0, "NC0"}, {1, "NC1"}, {2, "NC2"}, {255, "Not Available"}};

// 255 says "Available" here and nowhere else.
constexpr EnumText kPacketFlowContexts[] = {{0, "Not Supported"}, {1, "Supported"}, {255, "Available"}};

constexpr EnumText kPriorityAccessThresholds[] = {{0, "Barred (PKT access not allowed in the Cell)"},
    {1, "Barred"}, {2, "Barred"}, {3, "1 Only"}, {4, "1 to 2"}, {5, "1 to 3"}, {6, "1 to 4"}, {7, "Allowed"},
    {255, "Not Available"}};

constexpr EnumText kT3192[] = {{0, "500 ms"}, {1, "1000 ms"}, {2, "1500 ms"}, {3, "0 ms"}, {4, "80 ms"},
    {5, "120 ms"}, {6, "160 ms"}, {7, "200 ms"}};

constexpr EnumText kSI13Positions[] = {
    {0, "Located on BCCH"}, {1, "Located on Extended BCCH"}, {255, "Not Available"}};

} // namespace

GPRSInformation::GPRSInformation(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("GPRS Information", "GPRSInformation", dict, codeDict)
{
}

void GPRSInformation::update(const LogCode_0x51F5& report)
{
    RowWriter row = rows();
    row.setText(
        "Network Control Order", textFor(report.networkControlOrder(), kNetworkControlOrders, "Unknown"));
    row.setText("PFC Supported", textFor(report.packetFlowContext(), kPacketFlowContexts, "Unknown"));
    row.setText("Priority Access Threshold",
        textFor(report.priorityAccessThreshold(), kPriorityAccessThresholds, "Unknown"));
}

void GPRSInformation::update(const LogCode_0x7135& report)
{
    rows().setText(
        "Network Operating Mode", textFor(report.networkOperatingMode(), kNetworkOperatingModes, "Unknown"));
}

void GPRSInformation::update(const LogCode_0x51F6& report)
{
    RowWriter row = rows();
    row.setText("T3192", textFor(report.t3192(), kT3192, "?? ms"));
    row.setText("Access Burst Type", report.hasLongAccessBurst() ? "11-bit format" : "8-bit format");
    row.setText("DRX Timer Max", "%d", report.drxTimerMax());
}

void GPRSInformation::update(const LogCode_0x51FB& report)
{
    rows().setText("PBCCH Present", "%d", report.pbcchPresent());
}

void GPRSInformation::update(const LogCode_0x51FD& report)
{
    RowWriter row = rows();
    row.setText("Ext Measurement Order", "%d", report.extendedMeasurementOrder());
    row.setText("Packet PSI Status", "%d", report.packetPSIStatus());
    row.setText("Packet SI Status", report.hasPacketSIStatus() ? "Supported" : "Not Supported");
    row.setText("Count LR", "%d", report.countLowRepetition());
    row.setText("Count HR", "%d", report.countHighRepetition());
}

void GPRSInformation::update(const LogCode_0x51F4& report)
{
    rows().setText("SI13 Position", textFor(report.si13Position(), kSI13Positions, "Unknown"));
}

void GPRSInformation::update(const LogCode_0x5137& report)
{
    rows().setText("Cell Reselect Hysteresis", report.hasReselectHysteresis() ? "Applied" : "Not Applied");
}

} // namespace orvex
