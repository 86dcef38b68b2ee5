#pragma once

#include "GSM/EmptyCellSet.h"

namespace orvex {

// "Virtual Active Set": WCDMA cells of another carrier that would make an active set there.
class VirtualActiveSet final : public EmptyCellSet {
public:
    VirtualActiveSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : EmptyCellSet("Virtual Active Set", "VirtualActiveSet", dict, codeDict)
    {
    }
};

} // namespace orvex
