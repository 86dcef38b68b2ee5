#include "UTRAN/NeighbhorMeasurements.h"

#include "EnumTable.h"

namespace orvex {

namespace {

constexpr EnumText kStatuses[] = {{0, "ASET"}, {1, "MSET"}, {2, "DSET"}};

} // namespace

UTRANNeighbhorMeasurements::UTRANNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Neighbor Cell List", {Priority::warning, "NeighbhorMeasurements List"},
        OtherCodes::areIgnored, dict, codeDict)
{
}

void UTRANNeighbhorMeasurements::update(const LogCode_0xD00A& report)
{
    RowList list(array());
    for (const auto& neighbor : report.neighbors()) {
        RowWriter& row = list.next();
        row.setText("UARFCN", "%d", neighbor.uarfcn());
        row.setText("Cell ID", "%d", neighbor.cellIdentity());
        row.setText("Filter RSCP", "%f", neighbor.filteredRSCP());
        if (const char* status = textFor(neighbor.status(), kStatuses, nullptr))
            row.setText("Status", status);
        row.setText("inJDCS", neighbor.isInJDCS() ? "TRUE" : "FALSE");
    }
}

GSMNeighbhorMeasurements::GSMNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("GSM Neighbor Cell List", {Priority::warning, "GSM Neighbor Cell List"},
        OtherCodes::areIgnored, dict, codeDict)
{
}

void GSMNeighbhorMeasurements::update(const LogCode_0xD00E&)
{
    clearElementsInArray(array());
}

} // namespace orvex
