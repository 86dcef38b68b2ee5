#pragma once

#include "PacketSection.h"

namespace orvex {

// A section without packets: it shows what the template gives it.
class PlaceholderSection : public PacketSection<> {
protected:
    PlaceholderSection(
        const char* sectionName, const char* entryWord, ClassDictionary& dict, CodeDictionary& codeDict)
        : PacketSection(sectionName, {Priority::warning, entryWord}, OtherCodes::areIgnored, dict, codeDict)
    {
    }
};

// "Cell Change Counters"
class CellChangeCounters final : public PlaceholderSection {
public:
    CellChangeCounters(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("Cell Change Counters", "CellChangeCounters", dict, codeDict)
    {
    }
};

// "Coding Scheme". It has always been logged as CellChangeCounters.
class CodingScheme final : public PlaceholderSection {
public:
    CodingScheme(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("Coding Scheme", "CellChangeCounters", dict, codeDict)
    {
    }
};

// "Non-Ranked GSM Set"
class NonRankedGSMSet final : public PlaceholderSection {
public:
    NonRankedGSMSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("Non-Ranked GSM Set", "NonRankedGSMSet", dict, codeDict)
    {
    }
};

// "Non-Ranked UMTS Set"
class NonRankedUMTSSet final : public PlaceholderSection {
public:
    NonRankedUMTSSet(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("Non-Ranked UMTS Set", "NonRankedUMTSSet", dict, codeDict)
    {
    }
};

// "UMTS RR Measurement"
class UMTSRRMeasurement final : public PlaceholderSection {
public:
    UMTSRRMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
        : PlaceholderSection("UMTS RR Measurement", "UMTSRRMeasurement", dict, codeDict)
    {
    }
};

} // namespace orvex
