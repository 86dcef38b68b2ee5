#include "ClassIndex.h"

#include "Base.h"

#include "SystemLog.h"

#include <algorithm>

namespace orvex {

void CodeDictionary::subscribe(LogCode code, Base& section)
{
    const auto place = static_cast<std::size_t>(std::ranges::find(_codes, code) - _codes.begin());
    if (place == _codes.size()) {
        _codes.push_back(code);
        _subscribers.emplace_back();
    }
    _subscribers[place].push_back(&section);
}

const CodeDictionary::Subscribers* CodeDictionary::subscribers(LogCode code) const
{
    const auto place = static_cast<std::size_t>(std::ranges::find(_codes, code) - _codes.begin());
    return place == _codes.size() ? nullptr : &_subscribers[place];
}

std::vector<std::string> CodeDictionary::keys() const
{
    std::vector<std::string> result;
    result.reserve(_codes.size());
    for (const LogCode code : _codes)
        result.push_back(std::to_string(code));
    return result;
}

std::vector<PacketKind> CodeDictionary::packetKinds() const
{
    std::vector<PacketKind> result;
    for (std::size_t i = 0; i < _codes.size(); ++i) {
        std::string names;
        for (const Base* section : _subscribers[i])
            names += (names.empty() ? "" : ", ") + section->getSectionName();
        // Sections read packets of one code through one reader.
        result.push_back({_codes[i], names, _subscribers[i].front()->minimumLength(_codes[i])});
    }
    return result;
}

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
    // Constants: here the type of the class dictionary is fixed.
    systemLog(Priority::warning, "Dictionary = %d", 1);
    systemLog(Priority::warning, "String = %d", 0);
}

} // namespace orvex
