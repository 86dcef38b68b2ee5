#include "C2K/EVDO.h"

#include "EnumTable.h"

#include "SystemLog.h"

namespace orvex {

namespace {

constexpr int kAccess = 4;

constexpr EnumText kEVDOStates[] = {{0, "Inactive [0]"}, {1, "Acquisition [1]"}, {2, "Sync [2]"},
    {3, "Idle [3]"}, {kAccess, "Access [4]"}, {5, "Connected [5]"}};

constexpr EnumText kSessionStates[] = {{0, "Closed [0]"}, {1, "AMP setup [1]"}, {2, "AT-initiated neg [2]"},
    {3, "Initiated neg [3]"}, {4, "Open [4]"}};

DeferredText stateText(int value, std::span<const EnumText> states)
{
    return textOrNumberFor(value, states, "[Reserved %d]");
}

// Antenna 1 and the transmitter are off outside access and connection; their fields are then stale.
DeferredText powerText(int dBm, bool isOn)
{
    return isOn ? DeferredText("%+d dBm", dBm) : DeferredText("N/A");
}

DeferredText pnOffsetText(int offset)
{
    return offset == LogCode_0x1183::kNoPNOffset ? DeferredText("Invalid Value")
                                                 : DeferredText("%d × 64chips", offset);
}

} // namespace

void EVDOStatus::decode(Packet packet, Dictionary&, const Publisher& publisher)
{
    if (packet.size() != LogCode_0x1183::kLength) {
        systemLog(Priority::error, "Log code 0x1183 is %u bytes long but should be %lu bytes.",
            static_cast<unsigned>(packet.size()), static_cast<unsigned long>(LogCode_0x1183::kLength));
        return;
    }
    const LogCode_0x1183 status(packet);
    const bool transmits = status.deviceState() >= kAccess;
    publisher.setText("kChannel", "%d", status.channel());
    publisher.publish("k1xEVDODeviceState", stateText(status.deviceState(), kEVDOStates));
    publisher.publish("kBandClass", bandClassText(status.bandClass()));
    publisher.publish("kRxAGC0", powerText(status.rxAGC0(), true));
    publisher.publish("kRxAGC1", powerText(status.rxAGC1(), transmits));
    publisher.publish("kTxAGC", powerText(status.txAGC(), transmits));
    publisher.publish("kServingPNOffset", pnOffsetText(status.servingPNOffset()));
    publisher.publish("kSessionState", stateText(status.sessionState(), kSessionStates));
    publisher.setText("kUATI24", "0x%06x", status.uati24());
    publisher.setText("kColorCode", "%d", status.colorCode());
}

void EVDOActiveSet::decode(Packet packet, Dictionary&, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x12B6>(packet))
        return;
    const LogCode_0x12B6 report(packet);
    if (!report.holdsAllPilots()) {
        systemLog(Priority::error, "Log code 0x12b6 is %u bytes long, but has %d substructs.",
            static_cast<unsigned>(packet.size()), static_cast<int>(report.pilots().count()));
        return;
    }
    PilotList pilots;
    int index = 0;
    for (const auto& pilot : report.pilots())
        pilots.add(index++, pilot.pn(), DeferredText(decibelText, pilot.strength()));
    publisher.publish("kActiveSetPilots", pilots.rowsOrNone());
}

void EVDOFingers::decode(Packet packet, Dictionary&, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x108A>(packet))
        return;
    const LogCode_0x108A report(packet);
    if (!report.holdsJustItsFingers()) {
        systemLog(Priority::error,
            "Log code 0x108a has bad length of %u bytes, but has %d substructs (size=%lu).",
            static_cast<unsigned>(packet.size()), static_cast<int>(report.fingers().count()),
            static_cast<unsigned long>(LogCode_0x108A::kMinimumLength));
        return;
    }
    PilotList fingers;
    int index = -1;
    for (const auto& finger : report.fingers()) {
        ++index; // idle fingers keep their number
        if (!finger.isIdle())
            fingers.add(index, finger.pn(), DeferredText(decibelText, finger.carrierToInterference()));
    }
    publisher.publish("kFingerC2I", fingers.rowsOrNone());
}

} // namespace orvex
