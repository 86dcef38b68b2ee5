#pragma once

#include "GSM/PlaceholderSection.h"

namespace orvex {

// "UMTS RR Measurement"
class UMTSRRMeasurement final : public PlaceholderSection {
public:
    UMTSRRMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("UMTS RR Measurement", "UMTSRRMeasurement", dict, codeDict)
    {
    }
};

} // namespace orvex
