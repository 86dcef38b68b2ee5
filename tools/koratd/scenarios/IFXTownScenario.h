#pragma once

#include "IFXTown.h"
#include "PhaseCycle.h"
#include "Road.h"
#include "SteppedScenario.h"

#include <cstddef>

namespace orvex::korat {

// A handset with an IFX modem that is driven through a town, now idle and now with a data connection. Its
// report comes every second, in XML and in binary form by turns.
class IFXTownScenario final : public SteppedScenario {
public:
    explicit IFXTownScenario(const ScenarioSettings& settings);

    std::vector<LogCode> codes() const override { return {}; }

protected:
    void step() override;

private:
    void noteCellChange(const IFXReport::Cell& from);
    void report();

    Randomness _randomness;
    IFXTown _town;
    Road _road;
    PhaseCycle _life;
    std::vector<IFXReport::CellChange> _cellChanges; // the latest first
    int _locationUpdates = 1;                        // with the one at power-up
    double _frequencyError = 0;                      // Hz
};

} // namespace orvex::korat
