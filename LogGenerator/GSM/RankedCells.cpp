#include "GSM/RankedCells.h"

#include "TelephonyConstants.h"

namespace orvex {

namespace {

constexpr CellEntry kRankedCellEntries[] = {
    {telephony::kCellUARFCN, "UARFCN", "UARFCN", CellNumber::low16Bits},
    {telephony::kCellScramblingCode, "Scrambling Code", "Scrambling Code", CellNumber::low16Bits},
    {telephony::kCellRSCP, "RSCP", "RSCP", CellNumber::level, " dBm"},
    {telephony::kCellECN0, "Energy Per Chip", "Energy Per Chip", CellNumber::level, " dB"},
};

} // namespace

UMTSSet::UMTSSet(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("UMTS Set", "UMTSSet", dict, codeDict)
{
}

void UMTSSet::update(const LogCode_0x4005& report)
{
    RowList list(array());
    for (const auto& cell : report.umtsCells()) {
        RowWriter& row = list.next();
        row.setText("Scrambling Code", "%d", cell.primaryScramblingCode());
        row.setText("RSCP", "%d dB", cell.rscp()); // shown so, though it is dBm
        row.setText("Energy Per Chip", "%f dB", cell.ecNo());
        row.setText("Downlink Frequency", "%d", cell.downlinkUARFCN());
        row.setText("Ranking Value", "%d", cell.rankingValue());
        row.setText("Rank Cell RSCP", "%d dB", cell.rankingRSCP());
    }
}

void UMTSSet::update(const CellMonitorList& list)
{
    list.reportIfAbsent();
    RowList rows(array());
    for (const CellRecord& cell : list.findAll(telephony::kRadioUMTS, telephony::kCellTypeNeighbor))
        printCell(rows.next(), cell, kRankedCellEntries, "UMTSSet");
}

GSMSet::GSMSet(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("GSM Set", "GSMSet", dict, codeDict)
{
}

void GSMSet::update(const LogCode_0x4005& report)
{
    RowList list(array());
    for (const auto& cell : report.gsmCells()) {
        RowWriter& row = list.next();
        row.setText("ARFCN", "%d", cell.arfcn());
        row.setText("BSIC", "%d", cell.bsic());
        row.setText("RSSI", "%d dBm", cell.rssi());
        row.setText("Ranking Value", "%d", cell.rankingValue());
    }
}

} // namespace orvex
