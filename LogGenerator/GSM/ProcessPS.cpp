#include "GSM/ProcessPS.h"

#include "EnumTable.h"
#include "GSM/MobilityStates.h"

namespace orvex {

namespace {

constexpr EnumText kStates[] = {
    {0, "GMM_NULL"},
    {1, "GMM_DEREGISTERED"},
    {2, "GMM_REGISTERED_INITIATED"},
    {3, "GMM_REGISTERED"},
    {4, "GMM_DEREGISTERED_INITIATED"},
    {5, "GMM_ROUTING_AREA_UPDATE_INITIATED"},
    {6, "GMM_SERVICE_REQUEST_INITIATED"},
};

constexpr EnumText kSubStates[] = {
    {0, "GMM_NORMAL_SERVICE"},
    {1, "GMM_LIMITED_SERVICE"},
    {2, "GMM_ATTACH_NEEDED"},
    {3, "GMM_ATTEMPTING_TO_ATTACH"},
    {4, "GMM_NO_IMSI"},
    {5, "GMM_NO_CELL_AVAILABLE"},
    {6, "GMM_PLMN_SEARCH"},
    {7, "GMM_SUSPENDED"},
    {8, "GMM_UPDATE_NEEDED"},
    {9, "GMM_ATTEMPING_TO_UPDATE"}, // the modem's own spelling
    {10, "GMM_ATTEMPTING_TO_UPDATE_MM"},
    {11, "GMM_IMSI_DETACH_INITIATED"},
    {12, "GMM_NULL_SUBSTATE"},
};

constexpr EnumText kUpdateStatuses[] = {
    {0, "GMM_GU1_UPDATED"},
    {1, "GMM_GU2_NOT_UPDATED"},
    {2, "GMM_GU3_PLMN_NOT_ALLOWED"},
    {3, "GMM_GU3_ROUTING_AREA_NOT_ALLOWED"},
};

} // namespace

ProcessPS::ProcessPS(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Process PS", "ProcessPS", dict, codeDict)
{
}

void ProcessPS::update(const LogCode_0x7130& report)
{
    RowWriter row = rows();
    row.setText("MM State", textFor(report.state(), kStates, "Unknown"));
    row.setText("MM Sub State", textFor(report.subState(), kSubStates, "Unknown"));
    // The update status is what a rejected attach leaves behind.
    row.setText("Attach Reject Cause", textFor(report.updateStatus(), kUpdateStatuses, "Unknown"));
}

void ProcessPS::update(const LogCode_0x7132& report)
{
    rows().setText("MM Service State", registrationStateText(report.registrationState()));
}

} // namespace orvex
