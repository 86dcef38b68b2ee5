#include "GSMTownScenario.h"

#include "GPRSReports.h"
#include "GSMRadioReports.h"
#include "GSMTown.h"
#include "GSMTownCellMonitor.h"
#include "MobilityReports.h"
#include "Subscriber.h"
#include "WCDMARadioReports.h"
#include "WCDMASearcherReports.h"
#include "WCDMATrafficReports.h"

#include "packets/ExtraPacket.h"

namespace orvex::korat {

GSMTownScenario::GSMTownScenario(const ScenarioSettings& settings)
    : SteppedScenario(settings.start)
    , _randomness(settings.seed)
    , _road{gsmTown::kRoadLength, 14}
{
    _reports.push_back(std::make_unique<MobilityReports>());
    _reports.push_back(std::make_unique<GSMRadioReports>());
    _reports.push_back(std::make_unique<GPRSReports>());
    _reports.push_back(std::make_unique<WCDMARadioReports>());
    _reports.push_back(std::make_unique<WCDMASearcherReports>());
    _reports.push_back(std::make_unique<WCDMATrafficReports>());
    _reports.push_back(std::make_unique<GSMTownCellMonitor>());
}

std::vector<LogCode> GSMTownScenario::codes() const
{
    std::vector<LogCode> result{kSimFilesCode, kPDPContextsCode};
    for (const auto& reports : _reports)
        result.insert(result.end(), reports->codes().begin(), reports->codes().end());
    return result;
}

void GSMTownScenario::step()
{
    const double position = _road.positionAfter(elapsedSeconds());
    const bool isNewGSMCell = _gsm.step(position, _randomness);
    const bool isNewWCDMACell = _wcdma.step(position, _randomness);
    _day.step(_randomness);

    reportSubscription();
    const GSMTownMoment moment{
        now(), _day.phase(), _day.stepInPhase(), _gsm, _wcdma, isNewGSMCell, isNewWCDMACell, _randomness};
    std::vector<LogMessage> messages;
    for (const auto& reports : _reports)
        reports->report(moment, messages);
    for (LogMessage& message : messages)
        emit(std::move(message));
}

void GSMTownScenario::reportSubscription()
{
    if (isEvery(120 * kStepsPerSecond))
        emit(simFilesMessage(now(), subscriber::simFiles(gsmTown::kGSMArea.locationAreaCode)));
    const bool hasTransfer = _day.phase().hasTransfer();
    if (isEvery(60 * kStepsPerSecond) || hasTransfer != _hadTransfer)
        emit(pdpContextsMessage(now(), subscriber::pdpContexts("PDP context", hasTransfer)));
    _hadTransfer = hasTransfer;
}

} // namespace orvex::korat
