#include "C2KDataLink.h"

#include "packets/PacketWriter.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
constexpr double kStep = 0.1;             // s
constexpr double kBandwidth = 1.2288e6;   // Hz
constexpr double kEfficiency = 0.7;       // of what the bandwidth could carry
constexpr double kFastestForward = 2.1e6; // bit/s
constexpr double kFastestReverse = 4.5e5;
constexpr double kStrongestTransmitter = 23;  // dBm
constexpr double kHeadroomForFastest = 40;    // dB
constexpr double kReversePacketTime = 0.0267; // s, with its repetitions
constexpr double kUndecoded = 0.01;           // share of the forward packets

// The format of forward packets by carrier to interference, and the counter of what is not decoded.
constexpr struct {
    double least; // dB
    std::size_t counter;
    std::size_t undecoded;
} kFormats[] = {
    {9, 52, 53},
    {6, 45, 46},
    {3, 39, 40},
    {-1, 27, 28},
    {-6, 18, 19},
    {-HUGE_VAL, 3, 4},
};
static_assert(std::ranges::all_of(kFormats, [](const auto& format) {
    return C2KForwardLinkPacket::kBits[format.counter] > 0
        && C2KForwardLinkPacket::kBits[format.undecoded] == 0;
}));
} // namespace

C2KDataLink::C2KDataLink(Randomness& randomness)
{
    _forward.sequenceNumber = static_cast<std::uint32_t>(randomness.number(0, 100'000));
    _reverse.sequenceNumber = static_cast<std::uint32_t>(randomness.number(0, 100'000));
}

void C2KDataLink::transfer(double carrierToInterference, double transmitPower, Randomness& randomness)
{
    _load = std::clamp(_load + randomness.normal() * 0.03, 0.3, 0.8);
    receive(carrierToInterference, randomness);
    send(transmitPower, randomness);
}

void C2KDataLink::nextPeriod()
{
    ++_forward.sequenceNumber;
    ++_reverse.sequenceNumber;
}

void C2KDataLink::receive(double carrierToInterference, Randomness& randomness)
{
    const double capacity = kBandwidth * std::log2(1 + ratioOf(carrierToInterference));
    _bitsToReceive += std::min(capacity * kEfficiency * _load, kFastestForward) * kStep;
    const auto& format = *std::ranges::find_if(
        kFormats, [&](const auto& each) { return carrierToInterference >= each.least; });
    const int bits = C2KForwardLinkPacket::kBits[format.counter];
    for (; _bitsToReceive >= bits; _bitsToReceive -= bits)
        ++_forward.packets[randomness.chance(kUndecoded) ? format.undecoded : format.counter];
}

void C2KDataLink::send(double transmitPower, Randomness& randomness)
{
    const double headroom = (kStrongestTransmitter - transmitPower) / kHeadroomForFastest;
    const double rate = kFastestReverse * std::clamp(headroom, 0.1, 1.0) * _load;
    _bitsToSend += rate * kStep;
    std::size_t size = 0;
    while (size + 1 < C2KReverseLinkPacket::kSizeCount
        && C2KReverseLinkPacket::kBits[size + 1] <= rate * kReversePacketTime)
        ++size;
    const int bits = C2KReverseLinkPacket::kBits[size];
    const auto any = [&](std::size_t count) {
        return static_cast<std::size_t>(randomness.number(0, static_cast<int>(count) - 1));
    };
    for (; _bitsToSend >= bits; _bitsToSend -= bits) {
        auto& block = _reverse.sizes[size].packets[any(C2KReverseLinkPacket::kBlockCount)];
        auto& half = block[any(C2KReverseLinkPacket::kHalfCount)];
        ++half[any(C2KReverseLinkPacket::kColumnCount)];
    }
}

} // namespace orvex::korat
