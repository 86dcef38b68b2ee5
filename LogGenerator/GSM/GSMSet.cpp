#include "GSM/GSMSet.h"

namespace orvex {

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
