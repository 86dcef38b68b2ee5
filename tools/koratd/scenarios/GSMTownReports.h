#pragma once

#include "GSMLayer.h"
#include "GSMTownPhase.h"
#include "Randomness.h"
#include "WCDMALayer.h"

#include "packets/LogMessage.h"

#include <span>
#include <vector>

namespace orvex::korat {

// What happens in one step.
struct GSMTownMoment {
    Microseconds now;
    const GSMTownPhase& phase;
    int stepInPhase;
    const GSMLayer& gsm;
    const WCDMALayer& wcdma;
    bool isNewGSMCell;
    bool isNewWCDMACell;
    Randomness& randomness;

    bool isPhaseStart() const { return stepInPhase == 0; }
    // True in every n-th step of a phase, the first one included.
    bool isEvery(int steps) const { return stepInPhase % steps == 0; }
};

// A layer of the handset's protocols, which reports what concerns it.
class GSMTownReports {
public:
    virtual ~GSMTownReports() = default;

    virtual std::span<const LogCode> codes() const = 0;
    // Appends the messages of a step.
    virtual void report(const GSMTownMoment& moment, std::vector<LogMessage>& messages) = 0;
};

} // namespace orvex::korat
