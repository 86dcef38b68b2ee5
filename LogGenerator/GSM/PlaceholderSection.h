#pragma once

#include "Base.h"

#include "SystemLog.h"

namespace orvex {

// A section that wants no packets: what the template gives it stays.
class PlaceholderSection : public Base {
public:
    void updateWithData(Packet /*packet*/, LogCode /*logCode*/) final
    {
        systemLog(Priority::warning, "%s", _entryWord);
    }

protected:
    PlaceholderSection(
        const char* sectionName, const char* entryWord, ClassDictionary& dict, CodeDictionary& codeDict)
        : Base(sectionName, {}, dict, codeDict)
        , _entryWord(entryWord)
    {
    }

private:
    const char* _entryWord;
};

} // namespace orvex
