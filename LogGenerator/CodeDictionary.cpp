#include "CodeDictionary.h"

namespace orvex {

void CodeDictionary::subscribe(LogCode code, Base& section)
{
    const auto [entry, isNew] = _subscribers.try_emplace(code);
    if (isNew)
        _codes.push_back(code);
    entry->second.push_back(&section);
}

const CodeDictionary::Subscribers* CodeDictionary::subscribers(LogCode code) const
{
    const auto found = _subscribers.find(code);
    return found == _subscribers.end() ? nullptr : &found->second;
}

std::vector<std::string> CodeDictionary::keys() const
{
    std::vector<std::string> result;
    result.reserve(_codes.size());
    for (const LogCode code : _codes)
        result.push_back(std::to_string(code));
    return result;
}

} // namespace orvex
