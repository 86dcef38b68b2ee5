#pragma once

#include "GSM/EmptyCellSet.h"

namespace orvex {

// "Monitored Set": WCDMA cells that the network wants to be measured.
class MonitoredSet final : public EmptyCellSet {
public:
    MonitoredSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : EmptyCellSet("Monitored Set", "MonitoredSet", dict, codeDict)
    {
    }
};

} // namespace orvex
