#pragma once

#include "GSM/LogCode_0x4005.h"
#include "PacketSection.h"

namespace orvex {

// "GSM Set": GSM neighbours as ranked from WCDMA, one row dictionary each.
class GSMSet final : public PacketSection<LogCode_0x4005> {
public:
    GSMSet(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4005& report) override;
};

} // namespace orvex
