#pragma once

#include "Road.h"
#include "SteppedScenario.h"
#include "UTRANTown.h"

#include "packets/UTRANRRCStatePacket.h"

namespace orvex::korat {

// A handset on UTRAN that is driven through a town and goes through the RRC states again and again.
//
// Neighbours are reported twice a second, GSM neighbours every second, transport channels twice a second
// while there are any. In Cell FACH there is no gap to measure GSM in.
class UTRANTownScenario final : public SteppedScenario {
public:
    explicit UTRANTownScenario(const ScenarioSettings& settings);

    std::vector<LogCode> codes() const override;

protected:
    void step() override;

private:
    using State = UTRANRRCStatePacket::State;

    bool hasConnection() const;
    void changeState();
    void reportState();
    void reportServingCell();
    void reportNeighbors();
    void reportGSMNeighbors();
    void reportTransportChannels();
    void reportCellMonitor();
    void reportConnections();

    Randomness _randomness;
    UTRANTown _town;
    Road _road;
    std::optional<State> _state; // not known before the handset has found a cell
    std::size_t _nextState = 0;
    double _stateEnd = 2; // s
};

} // namespace orvex::korat
