#include "LTE/DetectedCells.h"

namespace orvex {

namespace {

void printRecord(RowWriter& row, const LogCode_0xB179::DetectedCell& cell)
{
    row.setText("Physical Cell ID", "%d", cell.physicalCellIdentity());
}

} // namespace

DetectedCells::DetectedCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Detected Cells", dict, codeDict)
{
}

void DetectedCells::update(const LogCode_0xB179& report)
{
    refillSection(report.detectedCells(), printRecord);
}

} // namespace orvex
