#include "C2K/OneXTrafficFrames.h"

#include "C2K/LogCode_0x119D.h"
#include "C2K/PacketLength.h"
#include "C2K/TrafficFER.h"

namespace orvex {

void OneXTrafficFrames::decode(Packet packet, Dictionary& state, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x119D>(packet))
        return;
    const auto demodulation = LogCode_0x119D(packet).trafficDemodulation();
    if (!demodulation) {
        systemLog(Priority::warning, "Log code 0x119d: missing traffic demod subpacket.");
        return;
    }
    if (const auto error = LogCode_0x119D::TrafficDemodulation(*demodulation).frameError())
        TrafficFER(state, publisher).addFrame(*error != 0);
}

} // namespace orvex
