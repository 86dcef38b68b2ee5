#include "GSM/MobilityManagement.h"

#include "EnumTable.h"

namespace orvex {

namespace {

const char* registrationStateText(int state)
{
    static constexpr EnumText kStates[] = {
        {0, "REG_STATE_INACTIVE"},
        {1, "REG_STATE_IDLE"},
        {2, "REG_STATE_REGISTERING"},
        {3, "REG_STATE_DEREGISTERING"},
        {4, "REG_STATE_MANUAL_SEARCH"},
        {5, "REG_STATE_AUTOMATIC_SEARCH"},
        {6, "REG_STATE_OFFLINE"},
    };
    return textFor(state, kStates, "Unknown");
}

const char* mmStateText(int state)
{
    // Numbered after the states of 3GPP TS 24.008, 4.1.2.1, hence the gaps. The blanks inside two of the
    // names are the modem's own.
    static constexpr EnumText kStates[] = {
        {0, "MM_NULL"},
        {3, "MM_LOCATION_UPDATE_INITIATED"},
        {5, "MM_WAIT_FOR_OUTGOING_MM_CONNECTION"},
        {6, "MM_CONNECTION_ACTIVE"},
        {7, "MM_IMSI_DETACH_INITIATED"},
        {8, "MM_PROCESS_CM_SERVICE_PROMPT"},
        {9, "MM_WAIT_FOR_NETWORK_COMMAND"},
        {10, "MM_LOCATION_UPDATE_REJECTED"},
        {13, "MM_WAIT_FOR_RR_CONNECTION_LU"},
        {14, "MM_WAIT_FOR_RR_CONNECTION_MM"},
        {15, "MM_WAIT_FOR_RR_CONNECTION_IMSI_DETACH"},
        {17, "MM_REESTABLISHMENT_INITIATED"},
        {18, "MM_WAIT_FOR_RR_ACTIVE"},
        {19, "MM_IDLE"},
        {20, "MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION"},
        {21, "MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT"},
        {22, "MM_WAIT_FOR_REESTABLISH_DECISION"},
        {23, "MM_LOCATION_UPDATING_PENDING"},
        {25, "MM_RR_CONNECTION_RELEASE_NOT_ALLOWED"},
    };
    return textFor(state, kStates, "Unknown");
}

constexpr EnumText kGMMStates[] = {
    {0, "GMM_NULL"},
    {1, "GMM_DEREGISTERED"},
    {2, "GMM_REGISTERED_INITIATED"},
    {3, "GMM_REGISTERED"},
    {4, "GMM_DEREGISTERED_INITIATED"},
    {5, "GMM_ROUTING_AREA_UPDATE_INITIATED"},
    {6, "GMM_SERVICE_REQUEST_INITIATED"},
};

constexpr EnumText kGMMSubStates[] = {
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

constexpr EnumText kGMMUpdateStatuses[] = {
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
    row.setText("MM State", textFor(report.state(), kGMMStates, "Unknown"));
    row.setText("MM Sub State", textFor(report.subState(), kGMMSubStates, "Unknown"));
    // The update status is what a rejected attach leaves behind.
    row.setText("Attach Reject Cause", textFor(report.updateStatus(), kGMMUpdateStatuses, "Unknown"));
}

void ProcessPS::update(const LogCode_0x7132& report)
{
    rows().setText("MM Service State", registrationStateText(report.registrationState()));
}

namespace {

constexpr EnumText kMMSubStates[] = {
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

constexpr EnumText kMMUpdateStatuses[] = {
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
    row.setText("MM Sub State", textFor(report.subState(), kMMSubStates, "Unknown"));
    // The update status is what a rejected location update leaves behind.
    row.setText("LU Reject Cause", textFor(report.updateStatus(), kMMUpdateStatuses, "Unknown"));
}

void ProcessCS::update(const LogCode_0x7132& report)
{
    rows().setText("MM Service State", registrationStateText(report.registrationState()));
}

// It has always been logged as Process CS.
ProcessCO::ProcessCO(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Process CO", "ProcessCS", dict, codeDict)
{
}

void ProcessCO::update(const LogCode_0x7131& report)
{
    rows().setText("MM State", mmStateText(report.state()));
}

void ProcessCO::update(const LogCode_0x7132& report)
{
    rows().setText("MM Service State", registrationStateText(report.registrationState()));
}

} // namespace orvex
