#pragma once

#include "C2K/SubpacketWalk.h"

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

} // namespace orvex
