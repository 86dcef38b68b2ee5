#pragma once

#include "LogMessage.h"
#include "PLMN.h"

namespace orvex::korat {

// The network and area that the handset is registered in.
//
//   13  u8      network operating mode, 0 to 2
//   14  u8      service
//   15  3 bytes network, a digit in every half byte, lower half first: MCC 1, MCC 2; MCC 3, MNC 3;
//               MNC 1, MNC 2. MNC 3 is 15 when there is none.
//   18  u16     location area code, big-endian
//   20  u8      routing area code
//   21  11 bytes, not read
struct ServingPLMNPacket {
    static constexpr LogCode kCode = 0x7135;

    enum class Service : std::uint8_t {
        none = 0,
        circuitSwitched = 1,
        packetSwitched = 2,
        both = 3,
        limited = 4
    };

    int operatingMode = 0;
    Service service = Service::none;
    PLMN plmn;
    int locationAreaCode = 0;
    int routingAreaCode = 0;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
