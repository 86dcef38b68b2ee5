#include "C2KEVDOHandset.h"

namespace orvex::korat {

namespace {
using State = C2KEVDOStatusPacket::State;
using Session = C2KEVDOStatusPacket::Session;

constexpr double kWeakestActive = -15; // dB, of a pilot that joins the active set of a connection
constexpr std::size_t kLargestActiveSet = 6;
constexpr std::size_t kFingers = 8;
constexpr double kWeakestEcho = -15;      // dB
constexpr double kSecondReceiverLoss = 3; // dB

constexpr struct {
    State state;
    Session session;
    PhaseCycle::Duration duration;
} kLife[] = {
    {State::inactive, Session::closed, {1, 2}},
    {State::acquisition, Session::closed, {1, 2}},
    {State::sync, Session::closed, {1, 1}},
    {State::idle, Session::closed, {1, 1}},
    {State::access, Session::setup, {1, 1}},
    {State::access, Session::terminalNegotiates, {1, 1}},
    {State::access, Session::networkNegotiates, {1, 1}},
    {State::idle, Session::open, {4, 8}},
    {State::access, Session::open, {1, 1}},
    {State::connected, Session::open, {12, 20}},
};
constexpr std::size_t kSetup = 4;       // the phase in which the network gives the handset an identifier
constexpr std::size_t kSessionOpen = 7; // the phase that comes after a connection
} // namespace

C2KEVDOHandset::C2KEVDOHandset()
    : _life(PhaseCycle::durationsOf(kLife), kSessionOpen)
{
}

bool C2KEVDOHandset::step(double seconds, const C2KTown& town, Randomness& randomness)
{
    const bool hasChanged = _life.step(seconds, !town.isCovered(), randomness);
    if (hasChanged && _life.current() == kSetup) {
        _uati24 = randomness.number(1, 0xFFFFFF);
        _colorCode = town.serving().sector->system->colorCode;
    }
    return hasChanged;
}

bool C2KEVDOHandset::isConnected() const
{
    return kLife[_life.current()].state == State::connected;
}

C2KEVDOStatusPacket C2KEVDOHandset::status(const C2KTown& town) const
{
    const auto& [state, session, duration] = kLife[_life.current()];
    const C2KSector& sector = *town.serving().sector;
    C2KEVDOStatusPacket packet;
    packet.channel = sector.system->channelEVDO;
    packet.bandClass = sector.system->bandClass;
    packet.receiveAGC0 = town.receivedPower();
    packet.receiveAGC1 = town.receivedPower() - kSecondReceiverLoss;
    packet.transmitAGC = town.transmitPower();
    if (!activePilots(town).empty())
        packet.servingPN = sector.pnOffset;
    packet.state = state;
    packet.session = session;
    packet.uati24 = _uati24;
    packet.colorCode = _colorCode;
    return packet;
}

C2KEVDOActiveSetPacket C2KEVDOHandset::activeSet(const C2KTown& town) const
{
    C2KEVDOActiveSetPacket packet;
    for (const auto& pilot : activePilots(town))
        packet.pilots.push_back({pilot.sector->pnOffset, pilot.strengthEVDO});
    return packet;
}

C2KEVDOFingerPacket C2KEVDOHandset::fingers(const C2KTown& town, Randomness& randomness) const
{
    C2KEVDOFingerPacket packet;
    for (const auto& pilot : activePilots(town)) {
        packet.fingers.push_back({pilot.sector->pnOffset, pilot.carrierToInterference});
        const double echo = pilot.carrierToInterference - randomness.number(3, 9);
        if (echo >= kWeakestEcho && randomness.chance(0.5)) {
            packet.fingers.push_back({pilot.sector->pnOffset, echo});
        } else { // a finger that has lost its path
            packet.fingers.emplace_back();
        }
    }
    packet.fingers.resize(kFingers);
    return packet;
}

std::vector<C2KTown::Pilot> C2KEVDOHandset::activePilots(const C2KTown& town) const
{
    const State state = kLife[_life.current()].state;
    if (state == State::inactive || state == State::acquisition)
        return {};
    auto pilots = town.pilots(kWeakestActive);
    const std::size_t largest = state == State::connected ? kLargestActiveSet : 1;
    if (pilots.size() > largest)
        pilots.resize(largest);
    return pilots;
}

} // namespace orvex::korat
