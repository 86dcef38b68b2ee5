#include "GSM/GSMServingCell.h"

#include "TelephonyConstants.h"

namespace orvex {

namespace {

constexpr CellEntry kCellEntries[] = {
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
        printCell(row, *cell, kCellEntries, "GSMServingCell");
}

} // namespace orvex
