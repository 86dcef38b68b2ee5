#include "LTE/MeasuredNeighborCells.h"

namespace orvex {

namespace {

void printRecord(RowWriter& row, const LogCode_0xB179::MeasuredNeighbor& neighbor)
{
    row.setText("Physical Cell ID", "%d", neighbor.physicalCellIdentity());
    row.setText("Filtered RSRP", "%4.2f dBm", neighbor.filteredRSRP());
    row.setText("Filtered RSRQ", "%4.2f dB", neighbor.filteredRSRQ());
}

} // namespace

MeasuredNeighborCells::MeasuredNeighborCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Measured Neighbor Cells", dict, codeDict)
{
}

void MeasuredNeighborCells::update(const LogCode_0xB179& report)
{
    refillSection(report.measuredNeighbors(), printRecord);
}

} // namespace orvex
