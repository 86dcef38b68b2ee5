#pragma once

#include "C2KTown.h"
#include "PhaseCycle.h"

#include "packets/C2KEVDOActiveSetPacket.h"
#include "packets/C2KEVDOFingerPacket.h"
#include "packets/C2KEVDOStatusPacket.h"

namespace orvex::korat {

// The EV-DO side of a handset: finds the network, negotiates a session, and has a connection now and then.
// Where there is no service it is inactive, and starts anew.
class C2KEVDOHandset {
public:
    C2KEVDOHandset();

    // Called in every step, with the scenario's time; true when the state has changed.
    bool step(double seconds, const C2KTown& town, Randomness& randomness);

    bool isConnected() const;
    C2KEVDOStatusPacket status(const C2KTown& town) const;
    C2KEVDOActiveSetPacket activeSet(const C2KTown& town) const;
    C2KEVDOFingerPacket fingers(const C2KTown& town, Randomness& randomness) const;

private:
    std::vector<C2KTown::Pilot> activePilots(const C2KTown& town) const;

    PhaseCycle _life;
    int _uati24 = 0; // from the session's setup on
    int _colorCode = 0;
};

} // namespace orvex::korat
