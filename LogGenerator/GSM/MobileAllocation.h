#pragma once

#include "GSM/LogCode_0x51F8.h"
#include "PacketSection.h"

namespace orvex {

// "Mobile Allocation": the channels that a hopping connection uses, in their order.
class MobileAllocation final : public PacketSection<LogCode_0x51F8> {
public:
    MobileAllocation(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x51F8& report) override;
};

} // namespace orvex
