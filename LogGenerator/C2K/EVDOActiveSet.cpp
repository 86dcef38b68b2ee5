#include "C2K/EVDOActiveSet.h"

#include "C2K/LogCode_0x12B6.h"
#include "C2K/PacketLength.h"
#include "C2K/PilotList.h"

namespace orvex {

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

} // namespace orvex
