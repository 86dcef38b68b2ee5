#include "CodeDictionary.h"

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

} // namespace orvex
