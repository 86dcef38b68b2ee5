#include "GSM/NeighboringCells.h"

#include "TelephonyConstants.h"

namespace orvex {

namespace {

// The list counts levels in steps of 2 dB.
constexpr CellEntry kCellEntries[] = {
    {telephony::kCellARFCN, "ARFCN", "ARFCN", CellNumber::low16Bits},
    {telephony::kCellRSSI, "RSSI", "RSSI", CellNumber::levelBy2, " dBm"},
};

DictionaryRef rowsOfCell(const CellRecord& cell)
{
    Rows row = Rows::make();
    printCell(row, cell, kCellEntries, "NeighboringCells");
    return row.dictionary();
}

} // namespace

NeighboringCells::NeighboringCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Neighboring Cells", "NeighboringCells", dict, codeDict)
{
}

DictionaryRef NeighboringCells::rowsOf(const LogCode_0x5137::Neighbor& neighbor) const
{
    Rows row = Rows::make();
    row.print("ARFCN", "%d", neighbor.arfcn());
    row.print("RSSI", "%d", neighbor.receiveLevel());
    row.print("C1 Value", "%d", neighbor.c1());
    if (const auto known = _arfcnToBsic.find(neighbor.arfcn()); known != _arfcnToBsic.end())
        row.print("BSIC", "%d", known->second);
    return row.dictionary();
}

void NeighboringCells::update(const LogCode_0x5137& report)
{
    refillSection(report.neighbors(), [this](const auto& neighbor) { return rowsOf(neighbor); });
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
    refillSection(list.findAll(telephony::kRadioGSM, telephony::kCellTypeNeighbor), rowsOfCell);
}

} // namespace orvex
