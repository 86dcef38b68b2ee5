#pragma once

#include "GSM/PlaceholderSection.h"

namespace orvex {

// "Non-Ranked GSM Set"
class NonRankedGSMSet final : public PlaceholderSection {
public:
    NonRankedGSMSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("Non-Ranked GSM Set", "NonRankedGSMSet", dict, codeDict)
    {
    }
};

} // namespace orvex
