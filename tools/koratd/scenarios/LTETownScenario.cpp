#include "LTETownScenario.h"

#include "Subscriber.h"

#include "packets/ExtraPacket.h"
#include "packets/LTEAntennaPacket.h"
#include "packets/LTEIntraFrequencyPacket.h"
#include "packets/LTENeighborMeasurementPacket.h"
#include "packets/LTEReselectionPacket.h"
#include "packets/LTEServingCellPacket.h"
#include "packets/LTEServingMeasurementPacket.h"

#include "Array.h"
#include "Dictionary.h"
#include "TelephonyConstants.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
// How weak a cell may be, in dBm, to be measured, and to be detected at all.
constexpr double kWeakestMeasured = -122;
constexpr double kWeakestDetected = -127;
constexpr double kNoLimit = 0;
constexpr std::size_t kLargestList = 32;

constexpr int kQRxLevMin = -128;     // dBm
constexpr int kSIntraSearch = 62;    // dB
constexpr int kSNonIntraSearch = 36; // dB
constexpr int kMaximumPower = 23;    // dBm

constexpr int kStepsBeforeNeighbors = 5; // a new cell's neighbours take half a second to find

int selectionLevel(double rsrp)
{
    return static_cast<int>(std::lround(rsrp)) - kQRxLevMin;
}

LTENeighborMeasurementPacket::Cell neighborRecord(const LTETown::Heard& heard, Randomness& randomness)
{
    LTENeighborMeasurementPacket::Cell record;
    record.physicalCellID = heard.cell->physicalCellID;
    record.rssi = heard.rssi;
    record.rsrp = heard.rsrp;
    record.averageRSRP = heard.averageRSRP;
    record.rsrq = heard.rsrq;
    record.averageRSRQ = heard.averageRSRQ;
    record.sRxLev = selectionLevel(heard.rsrp);
    record.frequencyOffset = randomness.number(0, 40);
    record.frameOffset = randomness.number(0, 1023);
    record.sampleOffset = randomness.number(0, 307199); // samples of a 10 ms frame at 30.72 MHz
    return record;
}
} // namespace

LTETownScenario::LTETownScenario(const ScenarioSettings& settings)
    : SteppedScenario(settings.start)
    , _randomness(settings.seed)
    , _road{LTETown::kRoadLength, 14}
{
}

std::vector<LogCode> LTETownScenario::codes() const
{
    return {LTEServingCellPacket::kCode, LTEAntennaPacket::kCode, LTEIntraFrequencyPacket::kCode,
        LTEServingMeasurementPacket::kCode, LTENeighborMeasurementPacket::kCode, LTEReselectionPacket::kCode,
        kSimFilesCode, kCellMonitorCode, kPDPContextsCode};
}

void LTETownScenario::step()
{
    const bool isNewCell = _town.step(_road.positionAfter(elapsedSeconds()), _randomness);
    _stepsOnCell = isNewCell ? 0 : _stepsOnCell + 1;

    if (isEvery(120 * kStepsPerSecond))
        emit(simFilesMessage(now(), subscriber::simFiles(_town.serving().cell->trackingAreaCode)));
    if (isNewCell || isEvery(15 * kStepsPerSecond))
        reportServingCell();
    if (isNewCell || isEvery(5 * kStepsPerSecond))
        reportCellMonitor();
    if (isEvery(60 * kStepsPerSecond))
        reportConnections();
    if (elapsedSeconds() >= _phaseEnd)
        changePhase();
    if (_isConnected) {
        reportConnected();
    } else {
        reportIdle();
    }
}

void LTETownScenario::changePhase()
{
    _isConnected = !_isConnected;
    _phaseEnd = elapsedSeconds() + _randomness.number(12, 20);
    _stepsOnCell = 0;
    _areRulesUpdated = !_isConnected;
    reportConnections();
}

void LTETownScenario::reportServingCell()
{
    const LTECell& cell = *_town.serving().cell;
    LTEServingCellPacket serving;
    serving.physicalCellID = cell.physicalCellID;
    serving.downlinkEARFCN = cell.carrier->earfcn;
    serving.uplinkEARFCN = cell.carrier->uplinkEARFCN();
    serving.downlinkResourceBlocks = cell.carrier->resourceBlocks;
    serving.uplinkResourceBlocks = cell.carrier->resourceBlocks;
    serving.cellIdentity = cell.cellIdentity;
    serving.trackingAreaCode = cell.trackingAreaCode;
    serving.band = cell.carrier->band;
    emit(serving.message(now()));
    emit(LTEAntennaPacket{cell.transmitAntennas}.message(now()));
}

void LTETownScenario::reportConnected()
{
    if (!isEvery(kStepsPerSecond / 5))
        return;
    const LTETown::Heard serving = _town.serving();
    const LTECarrier& carrier = *serving.cell->carrier;
    LTEIntraFrequencyPacket report;
    report.earfcn = carrier.earfcn;
    report.physicalCellID = serving.cell->physicalCellID;
    report.subframe = _randomness.number(0, 9);
    report.rsrp = serving.averageRSRP;
    report.rsrq = serving.averageRSRQ;
    if (_stepsOnCell >= kStepsBeforeNeighbors) {
        for (const auto& other : _town.othersOn(carrier, kWeakestMeasured, kNoLimit)) {
            // What is too much to measure is still known to be there.
            if (report.neighbors.size() < kLargestList) {
                report.neighbors.push_back(
                    {other.cell->physicalCellID, other.averageRSRP, other.averageRSRQ});
            } else {
                report.detectedCells.push_back(other.cell->physicalCellID);
            }
        }
        for (const auto& other : _town.othersOn(carrier, kWeakestDetected, kWeakestMeasured)) {
            if (report.detectedCells.size() < kLargestList)
                report.detectedCells.push_back(other.cell->physicalCellID);
        }
    }
    emit(report.message(now()));
}

void LTETownScenario::reportIdle()
{
    if (isEvery(kStepsPerSecond)) {
        const LTETown::Heard serving = _town.serving();
        LTEServingMeasurementPacket report;
        report.earfcn = serving.cell->carrier->earfcn;
        report.physicalCellID = serving.cell->physicalCellID;
        report.layerPriority = serving.cell->carrier->priority;
        report.rsrp = serving.rsrp;
        report.averageRSRP = serving.averageRSRP;
        report.rsrq = serving.rsrq;
        report.averageRSRQ = serving.averageRSRQ;
        report.rssi = serving.rssi;
        report.qRxLevMin = kQRxLevMin;
        if (serving.cell->carrier->band != 20)
            report.pMax = kMaximumPower;
        report.maximumPower = kMaximumPower;
        report.sRxLev = selectionLevel(serving.averageRSRP);
        report.drxCyclesBelowZero = report.sRxLev < 0 ? 1 : 0;
        if (serving.cell->carrier->band != 7)
            report.sIntraSearch = kSIntraSearch;
        report.sNonIntraSearch = kSNonIntraSearch;
        report.rulesUpdated = _areRulesUpdated;
        report.rules = report.sRxLev < kSNonIntraSearch ? 3 : 1;
        _areRulesUpdated = false;
        emit(report.message(now()));
    }
    if (isEvery(kStepsPerSecond / 2))
        reportNeighbors();
    if (isEvery(3 * kStepsPerSecond))
        reportCandidates();
}

void LTETownScenario::reportNeighbors()
{
    const auto& carriers = LTETown::carriers();
    const LTECarrier& carrier = carriers[_neighborCarrier++ % carriers.size()];
    LTENeighborMeasurementPacket report;
    report.earfcn = carrier.earfcn;
    report.qRxLevMin = kQRxLevMin;
    for (const auto& other : _town.othersOn(carrier, kWeakestMeasured, kNoLimit)) {
        if (report.cells.size() < LTENeighborMeasurementPacket::kLargestCount)
            report.cells.push_back(neighborRecord(other, _randomness));
    }
    if (!report.cells.empty())
        emit(report.message(now()));
}

void LTETownScenario::reportCandidates()
{
    using Candidate = LTEReselectionPacket::Candidate;
    const LTETown::Heard serving = _town.serving();
    LTEReselectionPacket report;
    report.servingEARFCN = serving.cell->carrier->earfcn;
    report.servingCellID = serving.cell->physicalCellID;
    // A handset that is served well looks for nothing.
    if (selectionLevel(serving.averageRSRP) < kSNonIntraSearch) {
        for (const LTECarrier& carrier : LTETown::carriers()) {
            const auto others = _town.othersOn(carrier, kWeakestMeasured, kNoLimit);
            for (std::size_t i = 0; i < std::min<std::size_t>(others.size(), 2); ++i) {
                report.candidates.push_back(
                    Candidate::makeLTE(carrier.priority, carrier.earfcn, others[i].cell->physicalCellID));
            }
        }
        if (_randomness.chance(0.7)) {
            report.candidates.push_back(
                Candidate::makeUTRAN(3, _randomness.chance(0.5) ? 10588 : 10613, _randomness.number(0, 511)));
        }
        if (_randomness.chance(0.6)) {
            report.candidates.push_back(
                Candidate::makeGERAN(2, _randomness.number(1, 124), 0, _randomness.number(0, 63)));
        }
        if (_randomness.chance(0.3)) {
            report.candidates.push_back(Candidate::makeCDMA(
                Candidate::Technology::cdma1x, 1, 0, _randomness.number(1, 799), _randomness.number(0, 511)));
        }
        if (_randomness.chance(0.3)) {
            report.candidates.push_back(Candidate::makeCDMA(Candidate::Technology::cdmaHRPD, 1, 1,
                _randomness.number(25, 1175), _randomness.number(0, 511)));
        }
        // Only the last one's details survive, so that each kind should come last at times.
        for (std::size_t i = report.candidates.size(); i > 1; --i) {
            std::swap(report.candidates[i - 1],
                report.candidates[static_cast<std::size_t>(_randomness.number(0, static_cast<int>(i) - 1))]);
        }
    }
    emit(report.message(now()));
}

void LTETownScenario::reportCellMonitor()
{
    const auto record = [](const LTETown::Heard& heard, const char* type) {
        return Dictionary::make({
            {telephony::kCellRadioAccessTechnology, telephony::kRadioLTE},
            {telephony::kCellType, type},
            {telephony::kCellMCC, subscriber::kMCC},
            {telephony::kCellMNC, subscriber::kMNC},
            {telephony::kCellTAC, heard.cell->trackingAreaCode},
            {telephony::kCellID, heard.cell->cellIdentity},
            {telephony::kCellPhysicalCellID, heard.cell->physicalCellID},
            {telephony::kCellBandInfo, heard.cell->carrier->band},
            {telephony::kCellUARFCN, heard.cell->carrier->earfcn},
            {telephony::kCellRSSI, static_cast<int>(std::lround(heard.rssi))},
        });
    };
    auto cells = Array::make({record(_town.serving(), telephony::kCellTypeServing)});
    for (const auto& other : _town.othersOn(*_town.serving().cell->carrier, kWeakestMeasured, kNoLimit)) {
        if (cells->size() <= kLargestList)
            cells->append(record(other, telephony::kCellTypeNeighbor));
    }
    emit(cellMonitorMessage(now(), cells));
}

void LTETownScenario::reportConnections()
{
    emit(pdpContextsMessage(now(), subscriber::pdpContexts("EPS bearer", _isConnected)));
}

} // namespace orvex::korat
