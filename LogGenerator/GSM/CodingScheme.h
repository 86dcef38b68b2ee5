#pragma once

#include "GSM/PlaceholderSection.h"

namespace orvex {

// "Coding Scheme". In the log it has always gone by the name of its neighbour.
class CodingScheme final : public PlaceholderSection {
public:
    CodingScheme(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("Coding Scheme", "CellChangeCounters", dict, codeDict)
    {
    }
};

} // namespace orvex
