#include "GSM/ProcessCS.h"

#include "EnumTable.h"
#include "GSM/MobilityStates.h"

namespace orvex {

namespace {

constexpr EnumText kSubStates[] = {
    {0, "MM_NULL_SUBSTATE"},
    {1, "MM_NO_IMSI"},
    {2, "MM_PLMN_SEARCH"},
    {3, "MM_LIMITED_SERVICE"},
    {4, "MM_ATTEMPTING_TO_UPDATE"},
    {5, "MM_LOCATION_UPDATE_NEEDED"},
    {6, "MM_NO_CELL_AVAILABLE"},
    {7, "MM_PLMN_SEARCH_NORMAL_SERVICE"},
    {8, "MM_NORMAL_SERVICE"},
};

constexpr EnumText kUpdateStatuses[] = {
    {0, "UPDATED"},
    {1, "NOT_UPDATED"},
    {2, "ROAMING_NOT_ALLOWED"},
    {3, "LOCATION_AREA_NOT_ALLOWED"},
};

} // namespace

ProcessCS::ProcessCS(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Process CS", "ProcessCS", dict, codeDict)
{
}

void ProcessCS::update(const LogCode_0x7131& report)
{
    RowWriter row = rows();
    row.setText("MM State", mmStateText(report.state()));
    row.setText("MM Sub State", textFor(report.subState(), kSubStates, "Unknown"));
    // The update status is what a rejected location update leaves behind.
    row.setText("LU Reject Cause", textFor(report.updateStatus(), kUpdateStatuses, "Unknown"));
}

void ProcessCS::update(const LogCode_0x7132& report)
{
    rows().setText("MM Service State", registrationStateText(report.registrationState()));
}

} // namespace orvex
