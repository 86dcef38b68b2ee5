#include "UTRAN/UTRANNeighbhorMeasurements.h"

#include "EnumTable.h"

namespace orvex {

namespace {

constexpr EnumText kStatuses[] = {{0, "ASET"}, {1, "MSET"}, {2, "DSET"}};

void printRecord(RowWriter& row, const LogCode_0xD00A::Neighbor& neighbor)
{
    row.setText("UARFCN", "%d", neighbor.uarfcn());
    row.setText("Cell ID", "%d", neighbor.cellIdentity());
    row.setText("Filter RSCP", "%f", neighbor.filteredRSCP());
    if (const char* status = textFor(neighbor.status(), kStatuses, nullptr))
        row.setText("Status", status);
    row.setText("inJDCS", neighbor.isInJDCS() ? "TRUE" : "FALSE");
}

} // namespace

UTRANNeighbhorMeasurements::UTRANNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Neighbor Cell List", {Priority::warning, "NeighbhorMeasurements List"},
        OtherCodes::areIgnored, dict, codeDict)
{
}

void UTRANNeighbhorMeasurements::update(const LogCode_0xD00A& report)
{
    refillSection(report.neighbors(), printRecord);
}

} // namespace orvex
