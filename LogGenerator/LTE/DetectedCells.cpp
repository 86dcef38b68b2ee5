#include "LTE/DetectedCells.h"

namespace orvex {

namespace {

DictionaryRef rowsOf(const LogCode_0xB179::DetectedCell& cell)
{
    Rows row = Rows::make();
    row.print("Physical Cell ID", "%d", cell.physicalCellIdentity());
    return row.dictionary();
}

} // namespace

DetectedCells::DetectedCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Detected Cells", dict, codeDict)
{
}

void DetectedCells::update(const LogCode_0xB179& report)
{
    refillSection(report.detectedCells(), rowsOf);
}

} // namespace orvex
