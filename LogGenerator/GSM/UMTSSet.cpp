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

void printCellRecord(Rows& row, const CellRecord& cell)
{
    printCell(row, cell, kCellEntries, "UMTSSet");
}

void printRankedCell(Rows& row, const LogCode_0x4005::UMTSCell& cell)
{
    row.print("Scrambling Code", "%d", cell.primaryScramblingCode());
    row.print("RSCP", "%d dB", cell.rscp()); // shown so, though it is dBm
    row.print("Energy Per Chip", "%f dB", cell.ecNo());
    row.print("Downlink Frequency", "%d", cell.downlinkUARFCN());
    row.print("Ranking Value", "%d", cell.rankingValue());
    row.print("Rank Cell RSCP", "%d dB", cell.rankingRSCP());
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
