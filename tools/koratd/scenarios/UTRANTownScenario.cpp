#include "UTRANTownScenario.h"

#include "Subscriber.h"

#include "packets/ExtraPacket.h"
#include "packets/UTRANGSMNeighborPacket.h"
#include "packets/UTRANNeighborPacket.h"
#include "packets/UTRANServingCellPacket.h"
#include "packets/UTRANTransportChannelPacket.h"

#include "Array.h"
#include "Dictionary.h"
#include "TelephonyConstants.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
constexpr double kWeakestMeasured = -108; // dBm
constexpr double kWeakestGSM = -103;      // dBm
constexpr std::size_t kLargestList = 32;
constexpr double kActiveSetMargin = 3; // dB

constexpr int kBand = 34;

// The level as a share of what the receiver can tell, -115 to -25 dBm.
double receiverShare(double rscp)
{
    return std::clamp((rscp + 115) / 90, 0.0, 255.0 / 256);
}
} // namespace

UTRANTownScenario::UTRANTownScenario(const ScenarioSettings& settings)
    : SteppedScenario(settings.start)
    , _randomness(settings.seed)
    , _road{UTRANTown::kRoadLength, 14}
{
}

std::vector<LogCode> UTRANTownScenario::codes() const
{
    return {UTRANRRCStatePacket::kCode, UTRANServingCellPacket::kCode, UTRANNeighborPacket::kCode,
        UTRANGSMNeighborPacket::kCode, UTRANTransportChannelPacket::kCode, kSimFilesCode, kCellMonitorCode,
        kPDPContextsCode};
}

void UTRANTownScenario::step()
{
    const bool isNewCell = _town.step(_road.positionAfter(elapsedSeconds()), _randomness);

    if (isEvery(120 * kStepsPerSecond))
        emit(simFilesMessage(now(), subscriber::simFiles(_town.serving().cell->locationAreaCode)));
    if (isEvery(60 * kStepsPerSecond))
        reportConnections();
    if (elapsedSeconds() >= _stateEnd) {
        changeState();
    } else if (isEvery(2 * kStepsPerSecond)) {
        reportState();
    }
    if (isNewCell || isEvery(10 * kStepsPerSecond))
        reportServingCell();
    if (isNewCell || isEvery(5 * kStepsPerSecond))
        reportCellMonitor();
    if (isEvery(kStepsPerSecond / 2))
        reportNeighbors();
    if (isEvery(kStepsPerSecond))
        reportGSMNeighbors();
    if (isEvery(kStepsPerSecond / 2))
        reportTransportChannels();
}

bool UTRANTownScenario::hasConnection() const
{
    return _state == State::cellDCH || _state == State::cellFACH;
}

void UTRANTownScenario::changeState()
{
    static constexpr struct {
        State state;
        int shortest; // s
        int longest;
    } kDay[] = {
        {State::disconnected, 5, 10},
        {State::connecting, 1, 1},
        {State::cellDCH, 10, 20},
        {State::cellFACH, 4, 8},
        {State::cellPCH, 4, 8},
        {State::uraPCH, 4, 8},
    };
    const auto& phase = kDay[_nextState++ % std::size(kDay)];
    const bool hadConnection = hasConnection();
    _state = phase.state;
    _stateEnd = elapsedSeconds() + _randomness.number(phase.shortest, phase.longest);
    reportState();
    if (hasConnection() != hadConnection)
        reportConnections();
}

void UTRANTownScenario::reportState()
{
    emit(UTRANRRCStatePacket{_state}.message(now()));
}

void UTRANTownScenario::reportServingCell()
{
    const UTRANCell& cell = *_town.serving().cell;
    UTRANServingCellPacket serving;
    serving.accessRestrictions = cell.isBarred ? 1 : 0;
    serving.uraID = cell.uraID;
    serving.uplinkUARFCN = cell.uarfcn;
    serving.downlinkUARFCN = cell.uarfcn;
    serving.cellIdentity = cell.cellIdentity;
    serving.emergencyCallsOnly = cell.isBarred;
    emit(serving.message(now()));
}

void UTRANTownScenario::reportNeighbors()
{
    using Set = UTRANNeighborPacket::Set;
    const auto serving = _town.serving();
    UTRANNeighborPacket report;
    for (const auto& other : _town.others(kWeakestMeasured)) {
        if (report.neighbors.size() >= kLargestList)
            break;
        UTRANNeighborPacket::Neighbor neighbor;
        neighbor.uarfcn = other.cell->uarfcn;
        neighbor.cellID = other.cell->cellParameterID;
        neighbor.filteredRSCP = receiverShare(other.level);
        if (!other.cell->isListed) {
            neighbor.set = Set::detected;
        } else if (_state == State::cellDCH && other.level > serving.level - kActiveSetMargin) {
            neighbor.set = Set::active;
        } else if (_state) {
            neighbor.set = Set::monitored;
        }
        neighbor.inJointDetectionSet = other.cell->uarfcn == serving.cell->uarfcn;
        report.neighbors.push_back(neighbor);
    }
    emit(report.message(now()));
}

void UTRANTownScenario::reportGSMNeighbors()
{
    UTRANGSMNeighborPacket report;
    if (_state != State::cellFACH) {
        for (const auto& heard : _town.gsmCells(kWeakestGSM)) {
            if (report.neighbors.size() >= kLargestList)
                break;
            UTRANGSMNeighborPacket::Neighbor neighbor;
            neighbor.cellID = heard.cell->cellID;
            neighbor.isBSICValid = heard.level > -95; // decoding takes a better signal than measuring
            neighbor.networkColorCode = neighbor.isBSICValid ? heard.cell->networkColorCode : 0;
            neighbor.baseStationColorCode = neighbor.isBSICValid ? heard.cell->baseStationColorCode : 0;
            neighbor.arfcn = heard.cell->arfcn;
            neighbor.rssi = heard.level;
            report.neighbors.push_back(neighbor);
        }
    }
    emit(report.message(now()));
}

void UTRANTownScenario::reportTransportChannels()
{
    UTRANTransportChannelPacket report;
    if (hasConnection()) {
        // Mostly a few; now and then as many as a packet can tell.
        const bool isFull = _randomness.chance(0.1);
        const int channels = isFull ? static_cast<int>(UTRANTransportChannelPacket::kLargestChannelCount)
                                    : _randomness.number(1, 8);
        const int composites = isFull ? static_cast<int>(UTRANTransportChannelPacket::kLargestCompositeCount)
                                      : _randomness.number(1, 4);
        const double share = receiverShare(_town.serving().level);
        for (int i = 0; i < channels; ++i) {
            const int rate = _randomness.chance(share) ? 0 : _randomness.number(1, 63);
            report.channels.push_back({i + 1, rate});
        }
        for (int j = 0; j < composites; ++j) {
            UTRANTransportChannelPacket::Composite composite;
            composite.identity = j + 1;
            composite.timeslot = j % 7;
            for (int& sir : composite.sir)
                sir = std::clamp(static_cast<int>(share * 63) + _randomness.number(-6, 6), 0, 63);
            report.composites.push_back(composite);
        }
    }
    emit(report.message(now()));
}

void UTRANTownScenario::reportCellMonitor()
{
    const auto record = [](const auto& heard, const char* type) {
        return Dictionary::make({
            {telephony::kCellRadioAccessTechnology, telephony::kRadioUTRAN},
            {telephony::kCellType, type},
            {telephony::kCellMCC, subscriber::kMCC},
            {telephony::kCellMNC, subscriber::kMNC},
            {telephony::kCellLAC, heard.cell->locationAreaCode},
            {telephony::kCellID, heard.cell->cellIdentity},
            {telephony::kCellBandInfo, kBand},
            {telephony::kCellScramblingCode, heard.cell->cellParameterID},
            {telephony::kCellUARFCN, heard.cell->uarfcn},
            {telephony::kCellRSCP, static_cast<int>(std::lround(heard.level))},
        });
    };
    auto cells = Array::make({record(_town.serving(), telephony::kCellTypeServing)});
    for (const auto& other : _town.others(kWeakestMeasured)) {
        if (cells->size() <= kLargestList)
            cells->append(record(other, telephony::kCellTypeNeighbor));
    }
    emit(cellMonitorMessage(now(), cells));
}

void UTRANTownScenario::reportConnections()
{
    emit(pdpContextsMessage(now(), subscriber::pdpContexts("PDP context", hasConnection())));
}

} // namespace orvex::korat
