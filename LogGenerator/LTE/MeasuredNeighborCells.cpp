#include "LTE/MeasuredNeighborCells.h"

namespace orvex {

MeasuredNeighborCells::MeasuredNeighborCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Measured Neighbor Cells", dict, codeDict)
{
}

void MeasuredNeighborCells::update(const LogCode_0xB179& report)
{
    RowList list(array());
    for (const auto& neighbor : report.measuredNeighbors()) {
        RowWriter& row = list.next();
        row.setText("Physical Cell ID", "%d", neighbor.physicalCellIdentity());
        row.setText("Filtered RSRP", "%4.2f dBm", neighbor.filteredRSRP());
        row.setText("Filtered RSRQ", "%4.2f dB", neighbor.filteredRSRQ());
    }
}

} // namespace orvex
