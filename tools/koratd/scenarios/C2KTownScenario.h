#pragma once

#include "C2K1xHandset.h"
#include "C2KDataLink.h"
#include "C2KEVDOHandset.h"
#include "Road.h"
#include "SteppedScenario.h"

namespace orvex::korat {

// A handset with a receiver for 1x and one for EV-DO that is driven out of its home network and back.
//
// 1x reports its state every second, twice a second in a call and less often asleep; every frame of a call
// is reported, fifty a second. EV-DO reports its state, pilots and fingers twice a second, and the counters
// of the connection every 1024 ms.
class C2KTownScenario final : public SteppedScenario {
public:
    explicit C2KTownScenario(const ScenarioSettings& settings);

    std::vector<LogCode> codes() const override;

protected:
    void step() override;

private:
    void step1x(bool isNewSector);
    void stepEVDO();
    void reportFrames();

    Randomness _randomness;
    C2KTown _town;
    Road _road;
    C2K1xHandset _1x;
    C2KEVDOHandset _evdo;
    C2KDataLink _link;
    std::int64_t _period = 0; // of the counters
};

} // namespace orvex::korat
