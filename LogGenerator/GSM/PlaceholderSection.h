#pragma once

#include "PacketSection.h"

namespace orvex {

// A section that wants no packets: what the template gives it stays.
class PlaceholderSection : public PacketSection<> {
protected:
    PlaceholderSection(
        const char* sectionName, const char* entryWord, ClassDictionary& dict, CodeDictionary& codeDict)
        : PacketSection(sectionName, {Priority::warning, entryWord}, OtherCodes::areIgnored, dict, codeDict)
    {
    }
};

} // namespace orvex
