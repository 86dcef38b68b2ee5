#include "UTRAN/UTRANNeighbhorMeasurements.h"

#include "EnumTable.h"
#include "UTRAN/LogCode_0xD00A.h"

#include "SystemLog.h"

namespace orvex {

namespace {

constexpr EnumText kStatuses[] = {{0, "ASET"}, {1, "MSET"}, {2, "DSET"}};

DictionaryRef rowsOf(const LogCode_0xD00A::Neighbor& neighbor)
{
    Rows row = Rows::make();
    row.print("UARFCN", "%d", neighbor.uarfcn());
    row.print("Cell ID", "%d", neighbor.cellIdentity());
    row.print("Filter RSCP", "%f", neighbor.filteredRSCP());
    if (const char* status = textFor(neighbor.status(), kStatuses, nullptr))
        row.set("Status", status);
    row.set("inJDCS", neighbor.isInJDCS() ? "TRUE" : "FALSE");
    return row.dictionary();
}

} // namespace

UTRANNeighbhorMeasurements::UTRANNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("Neighbor Cell List", {LogCode_0xD00A::kCode}, dict, codeDict)
{
}

void UTRANNeighbhorMeasurements::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "NeighbhorMeasurements List");
    if (logCode != LogCode_0xD00A::kCode || packet.size() < LogCode_0xD00A::kMinimumLength)
        return;
    clearSection();
    Array cells;
    for (const auto& neighbor : LogCode_0xD00A(packet).neighbors())
        cells.append(rowsOf(neighbor));
    replaceSection(cells);
}

} // namespace orvex
