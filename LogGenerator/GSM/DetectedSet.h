#pragma once

#include "GSM/EmptyCellSet.h"

namespace orvex {

// "Detected Set": WCDMA cells that were found without being told of.
class DetectedSet final : public EmptyCellSet {
public:
    DetectedSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : EmptyCellSet("Detected Set", "DetectedSet", dict, codeDict)
    {
    }
};

} // namespace orvex
