#pragma once

#include "GSMTownPhase.h"
#include "Randomness.h"

namespace orvex::korat {

// The phases that the handset goes through again and again, in about a minute: it is switched on and
// registers, is idle on GSM, makes a call and a transfer, moves to UMTS, where its first update is rejected,
// transfers data through all RRC states, moves back to GSM and is switched off.
class GSMTownDay {
public:
    // Called ten times a second.
    void step(Randomness& randomness);

    const GSMTownPhase& phase() const;
    int stepInPhase() const { return _stepInPhase; } // 0 in the first one

private:
    std::size_t _phase = static_cast<std::size_t>(-1); // the one before the first
    int _stepInPhase = 0;
    int _stepsLeft = 0;
};

} // namespace orvex::korat
