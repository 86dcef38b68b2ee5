#include "LTE/ConnectedModeMeasurement.h"

namespace orvex {

ConnectedModeMeasurementMisc::ConnectedModeMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Connected mode LTE Intra-frequency Measurement", dict, codeDict)
{
}

void ConnectedModeMeasurementMisc::update(const LogCode_0xB179& report)
{
    RowWriter row = rows();
    row.setText("E-ARFCN", "%d", report.earfcn());
    row.setText("Serving Physical Cell ID", "%d", report.servingPhysicalCellIdentity());
    row.setText("Subframe Number", "%d", report.subframeNumber());
    row.setText("Serving Filtered RSRP", "%4.2f dBm", report.servingFilteredRSRP());
    row.setText("Serving Filtered RSRQ", "%4.2f dB", report.servingFilteredRSRQ());
}

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
