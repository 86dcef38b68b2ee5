#pragma once

#include "Base.h"

namespace orvex {

// "CCTRCH SIR": signal-to-interference ratios of the coded composite transport channels, one row dictionary
// each.
class CCTRCHSIRMeasurement final : public Base {
public:
    CCTRCHSIRMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
