#include "GSM/GSMSet.h"

namespace orvex {

namespace {

void printRecord(Rows& row, const LogCode_0x4005::GSMCell& cell)
{
    row.print("ARFCN", "%d", cell.arfcn());
    row.print("BSIC", "%d", cell.bsic());
    row.print("RSSI", "%d dBm", cell.rssi());
    row.print("Ranking Value", "%d", cell.rankingValue());
}

} // namespace

GSMSet::GSMSet(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("GSM Set", "GSMSet", dict, codeDict)
{
}

void GSMSet::update(const LogCode_0x4005& report)
{
    refillSection(report.gsmCells(), printRecord);
}

} // namespace orvex
