#include "GSMRadioReports.h"

#include "GSMTown.h"

#include "packets/GSMDTXPacket.h"
#include "packets/GSMDedicatedChannelPacket.h"
#include "packets/GSMMeasurementPacket.h"
#include "packets/GSMMobileAllocationPacket.h"
#include "packets/GSMNeighborIdentityPacket.h"
#include "packets/GSMRRStatePacket.h"
#include "packets/GSMServingCellPacket.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
constexpr double kWeakestDecoded = -95;  // dBm; decoding the BSIC takes a better signal than measuring
constexpr double kWeakestAccess = -104;  // dBm, what C1 counts from
constexpr double kSpeechActivity = 0.45; // share of the time that one of two speaks
constexpr int kStepsOfReselection = 5;

constexpr int kFirstTrafficCarrier = 64; // ARFCN
constexpr int kCarrierSpacing = 4;

int c1(double level)
{
    return static_cast<int>(std::lround(level - kWeakestAccess));
}

// RXQUAL: 0 for the best eighth of bit error rates, 7 for the worst.
int quality(double level, Randomness& randomness)
{
    return std::clamp(static_cast<int>(std::lround((-84 - level) / 4 + randomness.normal())), 0, 7);
}

// Carriers between those of the broadcast channels; neighbouring cells hop over different ones.
GSMMobileAllocationPacket allocationOf(const GSMCell& cell)
{
    GSMMobileAllocationPacket allocation;
    allocation.hoppingSequenceNumber = 1 + cell.cellID % 63;
    for (int i = 0; i < 4 + cell.cellID % 5; ++i)
        allocation.arfcns.push_back(
            kFirstTrafficCarrier + cell.cellID % kCarrierSpacing + kCarrierSpacing * i);
    return allocation;
}

void reportMeasurements(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    const auto serving = moment.gsm.serving();
    GSMNeighborIdentityPacket identities;
    GSMMeasurementPacket measurements;
    measurements.level = serving.level;
    if (moment.phase.isCall()) {
        measurements.c1OrQualityFull = quality(serving.level, moment.randomness);
        measurements.c2OrQualitySub = quality(serving.level, moment.randomness);
    } else {
        measurements.c1OrQualityFull = std::max(c1(serving.level), 0);
        measurements.c2OrQualitySub = measurements.c1OrQualityFull + serving.cell->cellID % 4 * 2;
    }
    measurements.isHysteresisApplied = serving.cell->cellID % 2 != 0;
    for (const auto& other : moment.gsm.others(gsmTown::kWeakestGSM)) {
        if (measurements.neighbors.size() >= gsmTown::kLargestList)
            break;
        measurements.neighbors.push_back({other.cell->arfcn, other.level, c1(other.level)});
        if (other.level >= kWeakestDecoded)
            identities.neighbors.push_back({other.cell->arfcn, other.cell->bsic()});
    }
    messages.push_back(identities.message(moment.now));
    messages.push_back(measurements.message(moment.now));
}

void reportCallChannel(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    const auto allocation = allocationOf(*moment.gsm.serving().cell);
    if (moment.isPhaseStart() || moment.isNewGSMCell)
        messages.push_back(allocation.message(moment.now));
    if (moment.isEvery(5)) {
        const int last = static_cast<int>(allocation.arfcns.size()) - 1;
        const auto hop = static_cast<std::size_t>(moment.randomness.number(0, last));
        messages.push_back(GSMDedicatedChannelPacket{allocation.arfcns[hop]}.message(moment.now));
    }
    if (moment.isEvery(10)) {
        const bool isSilent = !moment.randomness.chance(kSpeechActivity);
        messages.push_back(GSMDTXPacket{isSilent}.message(moment.now));
    }
}
} // namespace

std::span<const LogCode> GSMRadioReports::codes() const
{
    static constexpr LogCode kCodes[] = {GSMRRStatePacket::kCode, GSMServingCellPacket::kCode,
        GSMNeighborIdentityPacket::kCode, GSMMeasurementPacket::kCode, GSMMobileAllocationPacket::kCode,
        GSMDedicatedChannelPacket::kCode, GSMDTXPacket::kCode};
    return kCodes;
}

void GSMRadioReports::report(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    const bool isReselected = _reselectionSteps > 0 && --_reselectionSteps == 0;
    if (isReselected || moment.isEvery(50))
        messages.push_back(moment.phase.rr.message(moment.now));
    if (!moment.phase.isOnGSM())
        return;
    if (moment.isNewGSMCell && moment.phase.rr.state == GSMRRStatePacket::State::idle) {
        _reselectionSteps = kStepsOfReselection;
        messages.push_back(
            GSMRRStatePacket{GSMRRStatePacket::State::cellReselection, 1, 1, false}.message(moment.now));
    }
    if (moment.isNewGSMCell || moment.isEvery(50)) {
        const GSMCell& cell = *moment.gsm.serving().cell;
        messages.push_back(GSMServingCellPacket{cell.arfcn, cell.bsic(), cell.cellID}.message(moment.now));
    }
    if (moment.isEvery(moment.phase.isCall() ? 5 : 10))
        reportMeasurements(moment, messages);
    if (moment.phase.isCall())
        reportCallChannel(moment, messages);
}

} // namespace orvex::korat
