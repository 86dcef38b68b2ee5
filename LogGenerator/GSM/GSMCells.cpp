#include "GSM/GSMCells.h"

#include "TelephonyConstants.h"

namespace orvex {

namespace {

constexpr CellEntry kServingCellEntries[] = {
    {telephony::kCellID, "Cell ID", "Cell ID"},
    {telephony::kCellARFCN, "ARFCN", "ARFCN"},
};

} // namespace

GSMServingCell::GSMServingCell(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("GSM Serving Cell", "GSMServingCell", dict, codeDict)
{
}

void GSMServingCell::update(const LogCode_0x5134& report)
{
    RowWriter row = rows();
    row.setText("Cell ID", "%d", report.cellIdentity());
    row.setText("ARFCN", "%d", report.arfcn());
    row.setText("BSIC", "%d", report.bsic());
}

void GSMServingCell::update(const LogCode_0x5137& report)
{
    RowWriter row = rows();
    row.setText("RSSI", "%d dBm", report.receiveLevel()); // the bare byte: the sign has never been shown
    row.setText("C1 Value", "%d", report.c1());
    row.setText("C2 Value", "%d", report.c2());
}

void GSMServingCell::update(const LogCode_0x5076& report)
{
    rows().setText("MA Dedicated ARFCN", "%d", report.arfcnLowByte());
}

void GSMServingCell::update(const CellMonitorList& list)
{
    list.reportIfAbsent();
    RowWriter row = rows();
    if (const CellRecord* cell = list.find({telephony::kRadioGSM}, telephony::kCellTypeServing))
        printCell(row, *cell, kServingCellEntries, "GSMServingCell");
}

namespace {

// The list counts levels in steps of 2 dB.
constexpr CellEntry kNeighborEntries[] = {
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
        printCell(rows.next(), cell, kNeighborEntries, "NeighboringCells");
}

} // namespace orvex
