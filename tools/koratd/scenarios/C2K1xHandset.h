#pragma once

#include "C2KTown.h"
#include "PhaseCycle.h"

#include "packets/C2K1xStatusPacket.h"
#include "packets/C2K1xTrafficPacket.h"

namespace orvex::korat {

// The 1x side of a handset: finds the network, sleeps from one paging slot to the next, and has a call now
// and then. Where there is no service it starts anew.
class C2K1xHandset {
public:
    using State = C2K1xStatusPacket::State;

    C2K1xHandset();

    // Called in every step, with the scenario's time; true when the state has changed.
    bool step(double seconds, const C2KTown& town, Randomness& randomness);

    State state() const;
    C2K1xStatusPacket status(const C2KTown& town) const;
    static C2K1xSystemPacket system(const C2KTown& town);
    // One of the frames of a call. Weak pilots make errors.
    static C2K1xTrafficPacket frame(const C2KTown& town, Randomness& randomness);

private:
    PhaseCycle _life;
};

} // namespace orvex::korat
