#pragma once

#include "Randomness.h"

#include "packets/C2KForwardLinkPacket.h"
#include "packets/C2KReverseLinkPacket.h"

namespace orvex::korat {

// What goes over an EV-DO connection, and the counters of it. Some hundred kbps to 2 Mbps come, up to some
// hundred kbps go; both wander with the load of the sector.
class C2KDataLink {
public:
    explicit C2KDataLink(Randomness& randomness);

    // A tenth of a second of a connection: carrier to interference in dB, the transmitter's power in dBm.
    void transfer(double carrierToInterference, double transmitPower, Randomness& randomness);
    // Another 1024 ms have gone by.
    void nextPeriod();

    const C2KForwardLinkPacket& forward() const { return _forward; }
    const C2KReverseLinkPacket& reverse() const { return _reverse; }

private:
    void receive(double carrierToInterference, Randomness& randomness);
    void send(double transmitPower, Randomness& randomness);

    double _load = 0.5;        // the share of the sector that this handset gets
    double _bitsToReceive = 0; // what the last packet left over
    double _bitsToSend = 0;
    C2KForwardLinkPacket _forward;
    C2KReverseLinkPacket _reverse;
};

} // namespace orvex::korat
