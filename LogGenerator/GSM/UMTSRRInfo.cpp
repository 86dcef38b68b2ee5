#include "GSM/UMTSRRInfo.h"

#include "EnumTable.h"

#include "TelephonyConstants.h"

#include <limits>

namespace orvex {

namespace {

constexpr EnumText kRRCStates[] = {{0, "Disconnected"}, {1, "Connecting"}, {2, "CELL_FACH"}, {3, "CELL_DCH"},
    {4, "CELL_PCH"}, {5, "URA_PCH"}};

constexpr CellEntry kRRInfoEntries[] = {
    {telephony::kCellID, "Cell ID", "Cell ID"},
    {telephony::kCellUARFCN, "UARFCN", "UARFCN"},
    {telephony::kCellScramblingCode, "Scrambling Code", "Scrambling Code"},
};

// Over the entries that have a power. NaN when none has: nothing was sent.
double averageTransmitPower(const LogCode_0x4031& report)
{
    double sum = 0;
    int count = 0;
    for (const auto& entry : report.entries()) {
        if (const auto power = entry.transmitPower()) {
            sum += *power;
            ++count;
        }
    }
    // Not 0.0 / 0.0, whose sign varies between machines and would show.
    return count ? sum / count : std::numeric_limits<double>::quiet_NaN();
}

} // namespace

UMTSRRInfo::UMTSRRInfo(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("UMTS RR Info", "UMTSRRInfo", dict, codeDict)
{
}

void UMTSRRInfo::update(const LogCode_0x4125& report)
{
    rows().setText("RRC State", textFor(report.state(), kRRCStates, "Unknown"));
}

void UMTSRRInfo::update(const LogCode_0x4031& report)
{
    rows().setText("Transmit Power", "%4.2lf dBm", averageTransmitPower(report));
}

void UMTSRRInfo::update(const LogCode_0x4127& report)
{
    RowWriter row = rows();
    row.setText("Cell ID", "%d", report.cellIdentity());
    row.setText("Downlink Frequency", "%d", report.downlinkUARFCN());
    row.setText("Uplink Frequency", "%d", report.uplinkUARFCN());
    row.remove("UARFCN"); // the cell-monitor list's; it belongs to the previous cell
    row.setText("URA ID", "%d", report.uraIdentity());
}

void UMTSRRInfo::update(const LogCode_0x4157& report)
{
    rows().setText("Ciphering", report.isCiphered() ? "Enabled" : "Disabled");
}

void UMTSRRInfo::update(const CellMonitorList& list)
{
    list.reportIfAbsent();
    RowWriter row = rows();
    if (const CellRecord* cell = list.find({telephony::kRadioUMTS}, telephony::kCellTypeServing))
        printCell(row, *cell, kRRInfoEntries, "UMTSRRInfo");
}

} // namespace orvex
