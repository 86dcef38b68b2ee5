#pragma once

#include "C2K/Publisher.h"
#include "C2K/SubpacketWalk.h"
#include "PacketReader.h"

namespace orvex {

// 1x traffic frames. Of its subpackets one is of interest:
//
//   11  traffic demodulation   24  u8  not 0 when the frame was received in error
class LogCode_0x119D {
public:
    static constexpr LogCode kCode = 0x119D;
    static constexpr std::size_t kMinimumLength = 17;

    class TrafficDemodulation {
    public:
        explicit TrafficDemodulation(const Subpacket& subpacket)
            : _subpacket(subpacket)
        {
        }

        // No value when the packet does not hold it.
        std::optional<int> frameError() const { return _subpacket.u8(24); }

    private:
        Subpacket _subpacket;
    };

    explicit LogCode_0x119D(Packet packet)
        : _subpackets(packet)
    {
    }

    std::optional<Subpacket> trafficDemodulation() const { return _subpackets.find(11); }

private:
    SubpacketWalk _subpackets;
};

// The frame-error rate of the 1x traffic channel: a running average over about 64 frames, kept in the
// generator state as "TrafficFER", 0 to 1. Single precision throughout: the last digit depends on it.
class TrafficFER {
public:
    TrafficFER(Dictionary& state, const Publisher& publisher)
        : _state(state)
        , _publisher(publisher)
    {
    }

    void addFrame(bool isErroneous);
    // Marks the average as old. The next frame begins a new one.
    void endTraffic();

private:
    Dictionary& _state;
    const Publisher& _publisher;
};

// 1x traffic frames: counts the erroneous ones into the frame-error rate.
class OneXTrafficFrames {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
