#include "IFXTownScenario.h"

#include "Subscriber.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
constexpr double kWeakestMeasured = -104; // dBm
constexpr std::size_t kCellChangesKept = 8;
constexpr double kPowerSum = -71; // dBm of received and transmitted power

constexpr double kFramesPerSecond[] = {26'000 / 120.0, 100}; // GSM, UMTS
constexpr int kFrameNumbers[] = {26 * 51 * 2048, 4096};

constexpr struct {
    const char* names[2]; // GSM, UMTS
    bool isConnected;
    PhaseCycle::Duration duration;
} kLife[] = {
    {{"Idle", "Idle"}, false, {6, 12}},
    {{"Access", "Connecting"}, false, {1, 1}},
    {{"Packet Transfer", "CELL_DCH"}, true, {8, 14}},
    {{"Packet Transfer", "CELL_FACH"}, true, {3, 6}},
    {{"Packet Idle", "CELL_PCH"}, false, {3, 6}},
};

std::vector<PhaseCycle::Duration> durations()
{
    std::vector<PhaseCycle::Duration> result;
    for (const auto& phase : kLife)
        result.push_back(phase.duration);
    return result;
}

// By the distance that the level speaks of; a step is about 550 m. UMTS has none.
int timingAdvance(const IFXReport::Cell& serving)
{
    const double distance = 20 * std::pow(10, (IFXTown::kGSMLevelAt20m - serving.level) / 35);
    return serving.isUMTS ? 0 : std::clamp(static_cast<int>(distance / 550), 0, 63);
}
} // namespace

IFXTownScenario::IFXTownScenario(const ScenarioSettings& settings)
    : SteppedScenario(settings.start)
    , _randomness(settings.seed)
    , _road{IFXTown::kRoadLength, 14}
    , _life(durations(), 0)
{
}

void IFXTownScenario::step()
{
    const bool isFirstStep = elapsed() == Microseconds{};
    const IFXReport::Cell before = isFirstStep ? IFXReport::Cell{} : _town.serving();
    const bool isNewCell = _town.step(_road.positionAfter(elapsedSeconds()), _randomness);
    if (isNewCell && !isFirstStep)
        noteCellChange(before);
    _life.step(elapsedSeconds(), false, _randomness);
    if (isEvery(kStepsPerSecond))
        report();
}

void IFXTownScenario::noteCellChange(const IFXReport::Cell& from)
{
    const IFXReport::Cell to = _town.serving();
    _cellChanges.insert(_cellChanges.begin(), {elapsedSeconds(), from.cellID, to.cellID});
    if (_cellChanges.size() > kCellChangesKept)
        _cellChanges.pop_back();
    if (to.areaCode != from.areaCode)
        ++_locationUpdates;
}

void IFXTownScenario::report()
{
    using Form = IFXReport::Form;
    _frequencyError = std::clamp(_frequencyError + _randomness.normal() * 5, -90.0, 90.0);

    IFXReport report;
    report.mcc = subscriber::kMCC;
    report.mnc = subscriber::kMNC;
    report.serving = _town.serving();
    report.neighbors = _town.others(kWeakestMeasured);
    const std::size_t technology = report.serving.isUMTS ? 1 : 0;
    const auto& phase = kLife[_life.current()];
    report.transmitPower = std::clamp(kPowerSum - report.serving.level, -50.0, 24.0);
    const double frames = elapsedSeconds() * kFramesPerSecond[technology];
    report.frameNumber = static_cast<int>(std::fmod(frames, kFrameNumbers[technology]));
    report.timingAdvance = timingAdvance(report.serving);
    report.frequencyError = _frequencyError;
    report.locationUpdates = _locationUpdates;
    report.cellChanges = _cellChanges;
    report.radioState = phase.names[technology];
    report.secondsInState = _life.secondsIn(elapsedSeconds());
    report.isConnected = phase.isConnected;
    report.contexts = subscriber::pdpContexts("PDP context", phase.isConnected);
    emit(report.message(isEvery(2 * kStepsPerSecond) ? Form::xml : Form::binary));
}

} // namespace orvex::korat
