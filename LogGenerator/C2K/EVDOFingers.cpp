#include "C2K/EVDOFingers.h"

#include "C2K/LogCode_0x108A.h"
#include "C2K/PacketLength.h"
#include "C2K/PilotList.h"

namespace orvex {

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
