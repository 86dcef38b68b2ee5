#include "LTE/DetectedCells.h"

#include "LTE/LogCode_0xB179.h"

#include "SystemLog.h"

namespace orvex {

DetectedCells::DetectedCells(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("Detected Cells", {LogCode_0xB179::kCode}, dict, codeDict)
{
}

void DetectedCells::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "%s", getSectionName().c_str());
    if (logCode != LogCode_0xB179::kCode)
        return reportUnknown(logCode);
    if (packet.size() < LogCode_0xB179::kMinimumLength)
        return;
    clearSection();
    const auto detected = LogCode_0xB179(packet).detectedCells();
    if (detected.count() == 0)
        return;
    Array cells;
    for (const auto& cell : detected) {
        Rows row = Rows::make();
        row.print("Physical Cell ID", "%d", cell.physicalCellIdentity());
        cells.append(row.dictionary());
    }
    replaceSection(cells);
}

} // namespace orvex
