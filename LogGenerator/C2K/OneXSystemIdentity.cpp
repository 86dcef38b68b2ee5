#include "C2K/OneXSystemIdentity.h"

#include "EnumTable.h"

namespace orvex {

namespace {

// Enhanced roaming indicator.
constexpr EnumText kRoamingIndicators[] = {
    {0, "OFF [0]"},
    {1, "ON [1]"},
    {2, "Flashing [2]"},
    {3, "Out of Neighborhood [3]"},
    {4, "Out of Building [4]"},
    {5, "Preferred system [5]"},
    {6, "Available system [6]"},
    {7, "Alliance partner [7]"},
    {8, "Premium partner [8]"},
    {9, "Full service functionality [9]"},
    {10, "Partial service functionality [10]"},
    {11, "Banner ON [11]"},
    {12, "Banner OFF [12]"},
};

DeferredText roamingText(int indicator)
{
    return textOrNumberFor(indicator, kRoamingIndicators, "ERI - %d");
}

} // namespace

void OneXSystemIdentity::decode(Packet packet, Dictionary&, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x134F>(packet))
        return;
    const LogCode_0x134F identity(packet);
    if (identity.version() < LogCode_0x134F::kLowestVersion) {
        systemLog(Priority::error,
            "Log code 0x134f has version=%d; only version 2 or higher expected; dropping.",
            identity.version());
        return;
    }
    publisher.publish("k1xRoamingHome", roamingText(identity.roamingIndicator()));
    if (identity.systemType() == LogCode_0x134F::kSystemTypeCDMA) {
        publisher.setText("kSystemId", "%d", identity.systemIdentity());
        publisher.setText("kNetworkId", "%d", identity.networkIdentity());
    } else {
        for (const char* row : {"kSystemId", "kNetworkId"})
            publisher.setText(row, "(unknown system type %d)", identity.systemType());
    }
    publisher.setText("kPacketZoneId", "%d", identity.packetZoneIdentity());
    if (const auto base = identity.baseIdentity())
        publisher.setText("kBaseId", "%d", *base);
    publisher.setText("kProtocolRevision", "%d", identity.protocolRevision());
}

} // namespace orvex
