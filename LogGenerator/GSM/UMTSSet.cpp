#include "GSM/UMTSSet.h"

#include "TelephonyConstants.h"

namespace orvex {

namespace {

constexpr CellEntry kCellEntries[] = {
    {telephony::kCellUARFCN, "UARFCN", "UARFCN", CellNumber::low16Bits},
    {telephony::kCellScramblingCode, "Scrambling Code", "Scrambling Code", CellNumber::low16Bits},
    {telephony::kCellRSCP, "RSCP", "RSCP", CellNumber::level, " dBm"},
    {telephony::kCellECN0, "Energy Per Chip", "Energy Per Chip", CellNumber::level, " dB"},
};

void printCellRecord(RowWriter& row, const CellRecord& cell)
{
    printCell(row, cell, kCellEntries, "UMTSSet");
}

void printRankedCell(RowWriter& row, const LogCode_0x4005::UMTSCell& cell)
{
    row.setText("Scrambling Code", "%d", cell.primaryScramblingCode());
    row.setText("RSCP", "%d dB", cell.rscp()); // shown so, though it is dBm
    row.setText("Energy Per Chip", "%f dB", cell.ecNo());
    row.setText("Downlink Frequency", "%d", cell.downlinkUARFCN());
    row.setText("Ranking Value", "%d", cell.rankingValue());
    row.setText("Rank Cell RSCP", "%d dB", cell.rankingRSCP());
}

} // namespace

UMTSSet::UMTSSet(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("UMTS Set", "UMTSSet", dict, codeDict)
{
}

void UMTSSet::update(const LogCode_0x4005& report)
{
    refillSection(report.umtsCells(), printRankedCell);
}

void UMTSSet::update(const CellMonitorList& list)
{
    list.reportIfAbsent();
    refillSection(list.findAll(telephony::kRadioUMTS, telephony::kCellTypeNeighbor), printCellRecord);
}

} // namespace orvex
