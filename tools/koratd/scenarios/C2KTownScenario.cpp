#include "C2KTownScenario.h"

namespace orvex::korat {

namespace {
constexpr Microseconds kPeriod{1'024'000};
constexpr Microseconds kFrame{20'000};

// In steps.
std::int64_t statusInterval(C2K1xHandset::State state)
{
    using State = C2K1xHandset::State;
    switch (state) {
    case State::traffic: return 5;
    case State::slottedSleep: return 51; // the slot cycle of 5.12 s
    default: return 10;
    }
}
} // namespace

C2KTownScenario::C2KTownScenario(const ScenarioSettings& settings)
    : SteppedScenario(settings.start)
    , _randomness(settings.seed)
    , _road{C2KTown::kRoadLength, 14}
    , _link(_randomness)
{
}

std::vector<LogCode> C2KTownScenario::codes() const
{
    return {C2K1xStatusPacket::kCode, C2K1xTrafficPacket::kCode, C2K1xSystemPacket::kCode,
        C2KEVDOStatusPacket::kCode, C2KEVDOActiveSetPacket::kCode, C2KEVDOFingerPacket::kCode,
        C2KForwardLinkPacket::kCode, C2KReverseLinkPacket::kCode};
}

void C2KTownScenario::step()
{
    const bool isNewSector = _town.step(_road.positionAfter(elapsedSeconds()), _randomness);
    step1x(isNewSector);
    stepEVDO();
    if (_1x.state() == C2K1xHandset::State::traffic)
        reportFrames(); // last, as they come up to the next step
}

void C2KTownScenario::step1x(bool isNewSector)
{
    const bool isNewState = _1x.step(elapsedSeconds(), _town, _randomness);
    if (isNewState || isEvery(statusInterval(_1x.state())))
        emit(_1x.status(_town).message(now()));
    if (_town.isCovered() && (isNewSector || isEvery(10 * kStepsPerSecond)))
        emit(C2K1xHandset::system(_town).message(now()));
}

void C2KTownScenario::stepEVDO()
{
    const bool isNewState = _evdo.step(elapsedSeconds(), _town, _randomness);
    if (isNewState || isEvery(kStepsPerSecond / 2)) {
        emit(_evdo.status(_town).message(now()));
        emit(_evdo.activeSet(_town).message(now()));
        emit(_evdo.fingers(_town, _randomness).message(now()));
    }
    if (_evdo.isConnected())
        _link.transfer(_town.serving().carrierToInterference, _town.transmitPower(), _randomness);
    if (const std::int64_t period = elapsed() / kPeriod; period != _period) {
        _period = period;
        _link.nextPeriod();
        emit(_link.forward().message(now()));
        emit(_link.reverse().message(now()));
    }
}

void C2KTownScenario::reportFrames()
{
    for (Microseconds later{}; later < kStep; later += kFrame)
        emit(C2K1xHandset::frame(_town, _randomness).message(now() + later), later);
}

} // namespace orvex::korat
