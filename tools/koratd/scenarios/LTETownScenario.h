#pragma once

#include "LTETown.h"
#include "Road.h"
#include "SteppedScenario.h"

namespace orvex::korat {

// A handset on LTE that is driven through a town, now idle and now with a data connection.
//
// Idle, it reports its serving cell, the neighbours of one carrier after the other, and reselection
// candidates; connected, the cells of its carrier five times a second. Reports about the serving cell come
// when it changes and now and then.
class LTETownScenario final : public SteppedScenario {
public:
    explicit LTETownScenario(const ScenarioSettings& settings);

    std::vector<LogCode> codes() const override;

protected:
    void step() override;

private:
    void changePhase();
    void reportServingCell();
    void reportConnected();
    void reportIdle();
    void reportNeighbors();
    void reportCandidates();
    void reportCellMonitor();
    void reportConnections();

    Randomness _randomness;
    LTETown _town;
    Road _road;
    bool _isConnected = false;
    double _phaseEnd = 10;            // s
    std::int64_t _stepsOnCell = 0;    // since it serves, or since the connection began
    std::size_t _neighborCarrier = 0; // whose neighbours come next
    bool _areRulesUpdated = false;
};

} // namespace orvex::korat
