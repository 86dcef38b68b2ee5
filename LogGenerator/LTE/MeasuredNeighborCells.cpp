#include "LTE/MeasuredNeighborCells.h"

#include "LTE/LogCode_0xB179.h"

#include "SystemLog.h"

namespace orvex {

MeasuredNeighborCells::MeasuredNeighborCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("Measured Neighbor Cells", {LogCode_0xB179::kCode}, dict, codeDict)
{
}

void MeasuredNeighborCells::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "%s", getSectionName().c_str());
    if (logCode != LogCode_0xB179::kCode)
        return reportUnknown(logCode);
    if (packet.size() < LogCode_0xB179::kMinimumLength)
        return;
    clearSection();
    const auto neighbors = LogCode_0xB179(packet).measuredNeighbors();
    if (neighbors.count() == 0)
        return;
    Array cells;
    for (const auto& neighbor : neighbors) {
        Rows row = Rows::make();
        row.print("Physical Cell ID", "%d", neighbor.physicalCellIdentity());
        row.print("Filtered RSRP", "%4.2f dBm", neighbor.filteredRSRP());
        row.print("Filtered RSRQ", "%4.2f dB", neighbor.filteredRSRQ());
        cells.append(row.dictionary());
    }
    replaceSection(cells);
}

} // namespace orvex
