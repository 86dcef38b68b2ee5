#include "LTE/MeasuredNeighborCells.h"

namespace orvex {

namespace {

DictionaryRef rowsOf(const LogCode_0xB179::MeasuredNeighbor& neighbor)
{
    Rows row = Rows::make();
    row.print("Physical Cell ID", "%d", neighbor.physicalCellIdentity());
    row.print("Filtered RSRP", "%4.2f dBm", neighbor.filteredRSRP());
    row.print("Filtered RSRQ", "%4.2f dB", neighbor.filteredRSRQ());
    return row.dictionary();
}

} // namespace

MeasuredNeighborCells::MeasuredNeighborCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Measured Neighbor Cells", dict, codeDict)
{
}

void MeasuredNeighborCells::update(const LogCode_0xB179& report)
{
    refillSection(report.measuredNeighbors(), rowsOf);
}

} // namespace orvex
