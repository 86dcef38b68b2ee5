#include "GSM/WCDMACellSets.h"

namespace orvex {

ActiveSet::ActiveSet(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Active Set", "ActiveSet", dict, codeDict)
{
}

void ActiveSet::update(const LogCode_0x417A& report)
{
    const auto cells = report.cells();
    const auto energies = report.energies();
    RowList list(array());
    // Energies come after all cells: if a cell's energies are in the packet, so is the cell.
    for (std::size_t i = 0; i < energies.countInside(); ++i) {
        if (!cells[i].isActive())
            continue;
        const int ecNo = lookUpECNO(energies[i].ecIo());
        RowWriter& row = list.next();
        row.setText("Scrambling Code", "%d", cells[i].primaryScramblingCode());
        row.setText("RSCP", "%d dB", report.rssi() + ecNo); // shown so, though it is dBm
        row.setText("Energy Per Chip", "%d dB", ecNo);
    }
}

EmptyCellSet::EmptyCellSet(
    const char* sectionName, const char* entryWord, ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(sectionName, entryWord, dict, codeDict)
{
}

void EmptyCellSet::update(const LogCode_0x417A& /*report*/)
{
    clearElementsInArray(array());
}

} // namespace orvex
