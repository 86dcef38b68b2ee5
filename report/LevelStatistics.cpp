#include "LevelStatistics.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace orvex {

void LevelStatistics::add(double level, std::int64_t milliseconds)
{
    _best = isEmpty() ? level : std::max(_best, level);
    _worst = isEmpty() ? level : std::min(_worst, level);
    _last = level;
    _weights[rounded(level)] += std::max<std::int64_t>(milliseconds, 1); // the last look counts, too
    while (_weights.size() > kLimit)
        coarsen();
}

double LevelStatistics::rounded(double level) const
{
    return _step == 0 ? level : std::round(level / _step) * _step;
}

void LevelStatistics::coarsen()
{
    constexpr double kFirstStep = 1.0 / 16;
    _step = _step == 0 ? kFirstStep : 2 * _step;
    for (const auto& [level, weight] : std::exchange(_weights, {}))
        _weights[rounded(level)] += weight;
}

double LevelStatistics::median() const
{
    std::int64_t total = 0;
    for (const auto& [level, weight] : _weights)
        total += weight;
    std::int64_t below = 0;
    for (const auto& [level, weight] : _weights) {
        below += weight;
        if (2 * below >= total)
            return level;
    }
    return 0;
}

void LevelStatistics::writeJson(JsonWriter& json) const
{
    const std::pair<const char*, double> members[] = {
        {"best", _best}, {"median", median()}, {"worst", _worst}, {"last", _last}};
    for (const auto& [name, number] : members) {
        json.key(name);
        if (isEmpty())
            json.null();
        else
            json.number(number);
    }
}

} // namespace orvex
