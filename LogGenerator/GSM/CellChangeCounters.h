#pragma once

#include "GSM/PlaceholderSection.h"

namespace orvex {

// "Cell Change Counters"
class CellChangeCounters final : public PlaceholderSection {
public:
    CellChangeCounters(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("Cell Change Counters", "CellChangeCounters", dict, codeDict)
    {
    }
};

} // namespace orvex
