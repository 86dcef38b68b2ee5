#include "ClassIndex.h"

#include "Console.h"
#include "SystemLog.h"

namespace orvex {

ClassIndex::~ClassIndex()
{
    writeConsoleLine("Deallocing ClassIndex");
}

Base* ClassIndex::getClass(std::string_view sectionName) const
{
    const auto found = _classDict.find(sectionName);
    return found == _classDict.end() ? nullptr : found->second;
}

const CodeDictionary::Subscribers* ClassIndex::getSubscribers(LogCode code) const
{
    return _codeDictionary.subscribers(code);
}

std::vector<std::string> ClassIndex::getAllLogCodes() const
{
    return _codeDictionary.keys();
}

void ClassIndex::status() const
{
    // The class dictionary is a dictionary and no string, by its type.
    systemLog(Priority::warning, "Dictionary = %d", 1);
    systemLog(Priority::warning, "String = %d", 0);
}

} // namespace orvex
