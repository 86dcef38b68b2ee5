#include "States.h"

#include <algorithm>

namespace orvex {

States::States(const std::vector<StateRule>& rules)
    : _rules(rules)
    , _bands(rules.size())
{
}

bool States::addRow(std::size_t number, const TimelineRow& row)
{
    const auto rule = std::ranges::find_if(
        _rules, [&](const StateRule& candidate) { return matches(candidate.path, row.path); });
    if (rule == _rules.end())
        return false;
    const auto place = static_cast<std::size_t>(rule - _rules.begin());
    std::vector<Band>& bands = _bands[place];
    if (bands.size() == kMostBands)
        return false;
    bands.emplace_back(row.key.empty() ? rule->title : rule->title + (", " + row.key), false);
    _places[number] = {place, bands.size() - 1};
    return true;
}

void States::set(std::size_t number, const std::string& text, const Moment& now)
{
    const auto [rule, band] = _places.at(number);
    _bands[rule][band].add(now.position, isBlank(text) ? "" : text);
}

void States::clear(std::size_t number, const Moment& now)
{
    set(number, "", now);
}

void States::finish(const Moment& /*last*/)
{
    for (std::vector<Band>& bands : _bands) {
        for (Band& band : bands)
            band.finish();
    }
}

void States::writeJson(JsonWriter& json) const
{
    for (const std::vector<Band>& bands : _bands) {
        for (const Band& band : bands) {
            if (!band.isEmpty())
                band.writeJson(json);
        }
    }
}

} // namespace orvex
