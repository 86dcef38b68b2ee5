#pragma once

#include "PacketSection.h"
#include "UTRAN/LogCode_0xD00C.h"

namespace orvex {

// "CCTRCH SIR": signal-to-interference ratios of the coded composite transport channels, one row dictionary
// each.
class CCTRCHSIRMeasurement final : public PacketSection<LogCode_0xD00C> {
public:
    CCTRCHSIRMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD00C& report) override;
};

} // namespace orvex
