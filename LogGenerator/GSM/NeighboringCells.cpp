#include "GSM/NeighboringCells.h"

#include "TelephonyConstants.h"

namespace orvex {

namespace {

// The list counts levels in steps of 2 dB.
constexpr CellEntry kCellEntries[] = {
    {telephony::kCellARFCN, "ARFCN", "ARFCN", CellNumber::low16Bits},
    {telephony::kCellRSSI, "RSSI", "RSSI", CellNumber::levelBy2, " dBm"},
};

} // namespace

NeighboringCells::NeighboringCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Neighboring Cells", "NeighboringCells", dict, codeDict)
{
}

void NeighboringCells::update(const LogCode_0x5137& report)
{
    RowList list(array());
    for (const auto& neighbor : report.neighbors()) {
        RowWriter& row = list.next();
        row.setText("ARFCN", "%d", neighbor.arfcn());
        row.setText("RSSI", "%d", neighbor.receiveLevel());
        row.setText("C1 Value", "%d", neighbor.c1());
        if (const auto known = _arfcnToBsic.find(neighbor.arfcn()); known != _arfcnToBsic.end())
            row.setText("BSIC", "%d", known->second);
    }
}

void NeighboringCells::update(const LogCode_0x51FF& report)
{
    _arfcnToBsic.clear();
    for (const auto& neighbor : report.neighbors())
        _arfcnToBsic[neighbor.arfcn()] = neighbor.bsic();
}

void NeighboringCells::update(const CellMonitorList& list)
{
    list.reportIfAbsent();
    RowList rows(array());
    for (const CellRecord& cell : list.findAll(telephony::kRadioGSM, telephony::kCellTypeNeighbor))
        printCell(rows.next(), cell, kCellEntries, "NeighboringCells");
}

} // namespace orvex
