#include "C2K1xHandset.h"

#include "packets/PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

namespace {
using State = C2K1xHandset::State;

constexpr double kWeakestActive = -14; // dB, of a pilot that joins the active set of a call
constexpr std::size_t kLargestActiveSet = 6;
constexpr double kSecondReceiverLoss = 2; // dB
constexpr int kProtocolRevision = 6;

constexpr struct {
    State state;
    PhaseCycle::Duration duration;
} kLife[] = {
    {State::acquisition, {1, 2}},
    {State::sync, {1, 1}},
    {State::paging, {3, 5}},
    {State::slottedSleep, {5, 9}},
    {State::paging, {1, 2}},
    {State::traffic, {10, 18}},
};
constexpr std::size_t kInService = 2; // the phase that comes after a call
} // namespace

C2K1xHandset::C2K1xHandset()
    : _life(PhaseCycle::durationsOf(kLife), kInService)
{
}

bool C2K1xHandset::step(double seconds, const C2KTown& town, Randomness& randomness)
{
    return _life.step(seconds, !town.isCovered(), randomness);
}

State C2K1xHandset::state() const
{
    return kLife[_life.current()].state;
}

C2K1xStatusPacket C2K1xHandset::status(const C2KTown& town) const
{
    const C2KSystem& system = *town.serving().sector->system;
    C2K1xStatusPacket packet;
    packet.state = state();
    const double power = town.receivedPower();
    packet.receivers[0] = {system.bandClass, system.channel1x, power};
    if (state() == State::traffic) {
        packet.receivers[1] = {system.bandClass, system.channel1x, power - kSecondReceiverLoss};
        packet.transmitAGC = town.transmitPower();
    }
    packet.referencePN = town.serving().sector->pnOffset;
    if (state() == State::acquisition)
        return packet; // without a pilot
    const std::size_t largest = state() == State::traffic ? kLargestActiveSet : 1;
    for (const auto& pilot : town.pilots(kWeakestActive)) {
        if (packet.pilots.size() < largest)
            packet.pilots.push_back({pilot.sector->pnOffset, pilot.strength1x});
    }
    return packet;
}

C2K1xSystemPacket C2K1xHandset::system(const C2KTown& town)
{
    const C2KSector& sector = *town.serving().sector;
    C2K1xSystemPacket packet;
    packet.roaming = sector.system->roaming;
    packet.systemID = sector.system->systemID;
    packet.networkID = sector.system->networkID;
    packet.packetZoneID = sector.packetZoneID;
    packet.protocolRevision = kProtocolRevision;
    packet.baseID = sector.baseID;
    return packet;
}

C2K1xTrafficPacket C2K1xHandset::frame(const C2KTown& town, Randomness& randomness)
{
    // 1 % where the pilot is good, ten times as much for every 6 dB below.
    const double probability = 0.01 * ratioOf((-9 - town.serving().strength1x) * 10 / 6);
    return {randomness.chance(std::clamp(probability, 0.005, 0.12))};
}

} // namespace orvex::korat
