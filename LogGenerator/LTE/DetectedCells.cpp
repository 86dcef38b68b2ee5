#include "LTE/DetectedCells.h"

namespace orvex {

DetectedCells::DetectedCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Detected Cells", dict, codeDict)
{
}

void DetectedCells::update(const LogCode_0xB179& report)
{
    RowList list(array());
    for (const auto& cell : report.detectedCells()) {
        RowWriter& row = list.next();
        row.setText("Physical Cell ID", "%d", cell.physicalCellIdentity());
    }
}

} // namespace orvex
