#pragma once

#include "GSM/LogCode_0x417A.h"
#include "PacketSection.h"

namespace orvex {

// A list of WCDMA cells that is emptied by every searcher packet and never filled: a place kept for the cells
// that are not in the active set.
class EmptyCellSet : public PacketSection<LogCode_0x417A> {
protected:
    EmptyCellSet(
        const char* sectionName, const char* entryWord, ClassDictionary& dict, CodeDictionary& codeDict);

    void update(const LogCode_0x417A& report) override;
};

} // namespace orvex
