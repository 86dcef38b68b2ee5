#pragma once

#include "GSMLayer.h"
#include "GSMTownDay.h"
#include "GSMTownReports.h"
#include "Road.h"
#include "SteppedScenario.h"
#include "WCDMALayer.h"

#include <memory>

namespace orvex::korat {

// A handset of GSM and UMTS that is driven through a town and goes through its day again and again.
class GSMTownScenario final : public SteppedScenario {
public:
    explicit GSMTownScenario(const ScenarioSettings& settings);

    std::vector<LogCode> codes() const override;

protected:
    void step() override;

private:
    void reportSubscription();

    Randomness _randomness;
    GSMLayer _gsm;
    WCDMALayer _wcdma;
    Road _road;
    GSMTownDay _day;
    std::vector<std::unique_ptr<GSMTownReports>> _reports;
    bool _hadTransfer = false;
};

} // namespace orvex::korat
