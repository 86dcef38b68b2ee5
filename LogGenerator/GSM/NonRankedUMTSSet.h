#pragma once

#include "GSM/PlaceholderSection.h"

namespace orvex {

// "Non-Ranked UMTS Set"
class NonRankedUMTSSet final : public PlaceholderSection {
public:
    NonRankedUMTSSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("Non-Ranked UMTS Set", "NonRankedUMTSSet", dict, codeDict)
    {
    }
};

} // namespace orvex
