#include "LTE/NeighborMeasurement.h"

#include "SystemLog.h"

namespace orvex {

NeighborMeasurementMisc::NeighborMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Neighbor Measurements", dict, codeDict)
{
}

void NeighborMeasurementMisc::update(const LogCode_0xB180& report)
{
    RowWriter row = rows();
    row.setText("Version", "%d", report.version());
    row.setText("E-ARFCN", "%d", report.earfcn());
    row.setText("Qrxlevmin", "%d dBm", report.qRxLevMin());
}

namespace {

// Every scaled row is logged as "Measured RSSI", whichever it is.
void printAndLog(RowWriter& row, const char* name, double value, const char* unit)
{
    row.setText(name, "%4.2f %s", value, unit);
    systemLog(Priority::warning, "Measured RSSI: %lf\n", value);
}

} // namespace

NeighborCellsList::NeighborCellsList(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Neighbor Cells List", dict, codeDict)
{
}

void NeighborCellsList::update(const LogCode_0xB180& report)
{
    const auto neighbors = report.neighborCells();
    systemLog(Priority::warning, "Number of neighboring cells being reported: %d\n",
        static_cast<int>(neighbors.count()));
    RowList list(array());
    for (const auto& cell : neighbors) {
        RowWriter& row = list.next();
        row.setText("Physical Cell ID", "%d", cell.physicalCellIdentity());
        systemLog(Priority::warning, "Physical Cell ID: %d\n", cell.physicalCellIdentity());
        printAndLog(row, "Measured RSSI", cell.measuredRSSI(), "dBm");
        printAndLog(row, "Measured RSRP", cell.measuredRSRP(), "dBm");
        printAndLog(row, "Average RSRP", cell.averageRSRP(), "dBm");
        printAndLog(row, "Measured RSRQ", cell.measuredRSRQ(), "dB");
        printAndLog(row, "Average RSRQ", cell.averageRSRQ(), "dB");
        row.setText("Srxlev", "%d dBm", cell.srxlev());
        row.setText("Frequency Offset", "%d", cell.frequencyOffset());
        row.setText("Ant 0 Frame Offset", "%d", cell.antenna0FrameOffset());
        row.setText("Ant 0 Sample Offset", "%d", cell.antenna0SampleOffset());
        // Antenna 1 shows antenna 0 again: the record has no other bits for it.
        row.setText("Ant 1 Frame Offset", "%d", cell.antenna0FrameOffset());
        row.setText("Ant 1 Sample Offset", "%d", cell.antenna0SampleOffset());
    }
}

} // namespace orvex
