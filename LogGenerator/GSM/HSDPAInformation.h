#pragma once

#include "GSM/LogCode_0x4221.h"
#include "PacketSection.h"

namespace orvex {

// "HSDPA Info": HARQ statistics of the WCDMA high-speed downlink. A carrier without processes in a packet
// keeps the list it had.
class HSDPAInformation final : public PacketSection<LogCode_0x4221> {
public:
    HSDPAInformation(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4221& report) override;
};

} // namespace orvex
