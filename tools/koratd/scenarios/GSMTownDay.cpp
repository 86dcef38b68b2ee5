#include "GSMTownDay.h"

#include <iterator>

namespace orvex::korat {

namespace {
using GMM = GMMStatePacket::State;
using GMMSub = GMMStatePacket::Substate;
using GMMUpdate = GMMStatePacket::Update;
using MM = MMStatePacket::State;
using MMSub = MMStatePacket::Substate;
using MMUpdate = MMStatePacket::Update;
using Reg = RegistrationPacket::State;
using RR = GSMRRStatePacket::State;
using RRC = WCDMARRCStatePacket::State;
using Selection = RegistrationPacket::Selection;
using Service = ServingPLMNPacket::Service;

constexpr MMStatePacket kMMUpdated{MM::idle, MMSub::normalService, MMUpdate::updated};
constexpr MMStatePacket kMMWaiting{
    MM::waitForRRConnectionForUpdate, MMSub::locationUpdateNeeded, MMUpdate::notUpdated};
constexpr MMStatePacket kMMUpdating{
    MM::locationUpdateInitiated, MMSub::attemptingToUpdate, MMUpdate::notUpdated};
constexpr MMStatePacket kMMElsewhere{MM::idle, MMSub::locationUpdateNeeded, MMUpdate::notUpdated};
constexpr GMMStatePacket kGMMDetached{GMM::deregistered, GMMSub::attachNeeded, GMMUpdate::notUpdated};
constexpr GMMStatePacket kGMMAttached{GMM::registered, GMMSub::normalService, GMMUpdate::updated};
constexpr GMMStatePacket kGMMSuspended{GMM::registered, GMMSub::suspended, GMMUpdate::updated};
constexpr GMMStatePacket kGMMElsewhere{GMM::registered, GMMSub::updateNeeded, GMMUpdate::notUpdated};
constexpr GMMStatePacket kGMMUpdating{
    GMM::routingAreaUpdateInitiated, GMMSub::updateNeeded, GMMUpdate::notUpdated};

// Length in steps, RR, RRC, MM, GMM, registration, service.
constexpr GSMTownPhase kPhases[] = {
    // Switched on: a cell, a location update, a GPRS attach.
    {8, 12, {RR::cellSelection, 1, 0, false}, {}, {MM::null, MMSub::plmnSearch, MMUpdate::notUpdated},
        {GMM::null, GMMSub::plmnSearch, GMMUpdate::notUpdated}, {Reg::automaticSearch}, Service::none},
    {4, 8, {RR::connectionPending, 1, 1, false}, {}, kMMWaiting, kGMMDetached, {Reg::registering},
        Service::limited},
    {8, 12, {RR::dataTransfer, 2, 1, false}, {}, kMMUpdating, kGMMDetached, {Reg::registering},
        Service::limited},
    {5, 8, {RR::idle, 0, 0, true}, {}, kMMUpdated,
        {GMM::registeredInitiated, GMMSub::attemptingToAttach, GMMUpdate::notUpdated}, {Reg::registering},
        Service::circuitSwitched},
    // Idle, a call, a transfer.
    {60, 80, {RR::idle, 0, 0, false}, {}, kMMUpdated, kGMMAttached, {Reg::idle}, Service::both},
    {6, 10, {RR::connectionPending, 1, 1, false}, {},
        {MM::waitForRRConnection, MMSub::normalService, MMUpdate::updated}, kGMMSuspended, {Reg::idle},
        Service::both},
    {60, 80, {RR::dataTransfer, 2, 1, false}, {},
        {MM::connectionActive, MMSub::normalService, MMUpdate::updated}, kGMMSuspended, {Reg::idle},
        Service::circuitSwitched},
    {3, 5, {RR::connectionRelease, 3, 1, false}, {},
        {MM::waitForNetworkCommand, MMSub::normalService, MMUpdate::updated}, kGMMSuspended, {Reg::idle},
        Service::both},
    {20, 30, {RR::dataTransfer, 2, 1, true}, {}, kMMUpdated, kGMMAttached, {Reg::idle}, Service::both},
    // To UMTS, where the first update is rejected.
    {8, 12, {RR::reselectionToUMTS, 1, 2, true}, {}, kMMElsewhere, kGMMElsewhere, {Reg::idle},
        Service::limited},
    {8, 10, {}, RRC::connecting, kMMWaiting, kGMMElsewhere, {Reg::registering}, Service::limited},
    {10, 15, {}, RRC::disconnected,
        {MM::locationUpdateRejected, MMSub::limitedService, MMUpdate::areaNotAllowed}, kGMMElsewhere,
        {Reg::manualSearch, Selection::limited}, Service::limited},
    {8, 10, {}, RRC::cellFACH, kMMUpdating, kGMMUpdating, {Reg::registering, Selection::manual},
        Service::limited},
    {20, 30, {}, RRC::disconnected, kMMUpdated, kGMMAttached, {Reg::idle, Selection::manual}, Service::both},
    // Data through all RRC states.
    {5, 8, {}, RRC::connecting, kMMUpdated,
        {GMM::serviceRequestInitiated, GMMSub::normalService, GMMUpdate::updated},
        {Reg::idle, Selection::manual}, Service::both},
    {90, 120, {}, RRC::cellDCH, kMMUpdated, kGMMAttached, {Reg::idle, Selection::manual}, Service::both},
    {20, 30, {}, RRC::cellFACH, kMMUpdated, kGMMAttached, {Reg::idle, Selection::manual}, Service::both},
    {20, 30, {}, RRC::cellPCH, kMMUpdated, kGMMAttached, {Reg::idle, Selection::manual}, Service::both},
    {20, 30, {}, RRC::uraPCH, kMMUpdated, kGMMAttached, {Reg::idle, Selection::manual}, Service::both},
    // Back to GSM, and off.
    {8, 12, {RR::reselectionFromUMTS, 1, 2, true}, {}, kMMElsewhere, kGMMElsewhere, {Reg::idle},
        Service::limited},
    {8, 12, {RR::dataTransfer, 2, 1, true}, {}, kMMUpdating, kGMMUpdating, {Reg::registering},
        Service::limited},
    {30, 40, {RR::idle, 0, 0, false}, {}, kMMUpdated, kGMMAttached, {Reg::idle}, Service::both},
    {8, 10, {RR::connectionRelease, 3, 1, false}, {},
        {MM::imsiDetachInitiated, MMSub::normalService, MMUpdate::updated},
        {GMM::deregisteredInitiated, GMMSub::normalService, GMMUpdate::updated}, {Reg::deregistering},
        Service::circuitSwitched},
    {8, 10, {}, {}, {}, {}, {Reg::offline}, Service::none},
};
} // namespace

void GSMTownDay::step(Randomness& randomness)
{
    ++_stepInPhase;
    if (_stepsLeft-- > 0)
        return;
    _phase = (_phase + 1) % std::size(kPhases);
    _stepInPhase = 0;
    _stepsLeft = randomness.number(phase().shortest, phase().longest) - 1;
}

const GSMTownPhase& GSMTownDay::phase() const
{
    return kPhases[_phase];
}

} // namespace orvex::korat
