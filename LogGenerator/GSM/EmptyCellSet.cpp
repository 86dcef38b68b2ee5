#include "GSM/EmptyCellSet.h"

namespace orvex {

EmptyCellSet::EmptyCellSet(
    const char* sectionName, const char* entryWord, ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(sectionName, entryWord, dict, codeDict)
{
}

void EmptyCellSet::update(const LogCode_0x417A& /*report*/)
{
    clearElementsInArray(array());
}

} // namespace orvex
