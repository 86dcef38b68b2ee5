#include "GSM/GSMSet.h"

namespace orvex {

namespace {

void printRecord(RowWriter& row, const LogCode_0x4005::GSMCell& cell)
{
    row.setText("ARFCN", "%d", cell.arfcn());
    row.setText("BSIC", "%d", cell.bsic());
    row.setText("RSSI", "%d dBm", cell.rssi());
    row.setText("Ranking Value", "%d", cell.rankingValue());
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
