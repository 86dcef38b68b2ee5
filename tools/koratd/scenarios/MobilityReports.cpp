#include "MobilityReports.h"

#include "GSMTown.h"

#include "packets/EquivalentPLMNPacket.h"

namespace orvex::korat {

namespace {
// Equivalent networks as an update brings them; none where there is no service. The packet overlays the
// last digits of each with the first of the next, and these are chosen so that they agree.
EquivalentPLMNPacket equivalentNetworks(const GSMTownPhase& phase)
{
    if (phase.service != ServingPLMNPacket::Service::both)
        return {};
    if (phase.isOnUMTS())
        return {{{1, 901, 3}}};
    return {{{1, 199, 3}, gsmTown::kUMTSArea.plmn, {1, 901, 3}}};
}

ServingPLMNPacket servingNetwork(const GSMTownPhase& phase)
{
    const gsmTown::Area& area = phase.isOnUMTS() ? gsmTown::kUMTSArea : gsmTown::kGSMArea;
    ServingPLMNPacket serving;
    serving.operatingMode = phase.isOnUMTS() ? 0 : 1;
    serving.service = phase.service;
    serving.plmn = area.plmn;
    serving.locationAreaCode = area.locationAreaCode;
    serving.routingAreaCode = area.routingAreaCode;
    return serving;
}
} // namespace

std::span<const LogCode> MobilityReports::codes() const
{
    static constexpr LogCode kCodes[] = {MMStatePacket::kCode, GMMStatePacket::kCode,
        RegistrationPacket::kCode, ServingPLMNPacket::kCode, EquivalentPLMNPacket::kCode};
    return kCodes;
}

void MobilityReports::report(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    if (!moment.isEvery(50))
        return;
    messages.push_back(moment.phase.registration.message(moment.now));
    messages.push_back(moment.phase.mm.message(moment.now));
    messages.push_back(moment.phase.gmm.message(moment.now));
    messages.push_back(servingNetwork(moment.phase).message(moment.now));
    messages.push_back(equivalentNetworks(moment.phase).message(moment.now));
}

} // namespace orvex::korat
