#include "GSM/MobilityStates.h"

#include "EnumTable.h"

namespace orvex {

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

} // namespace orvex
