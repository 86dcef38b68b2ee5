#pragma once

#include "TreeJson.h"

#include <cstdint>
#include <map>

namespace orvex {

// Best, worst, last and median of a level, each value weighted by how long it held.
class LevelStatistics {
public:
    // Up to so many values are told apart; then the median is rounded to a step, which doubles from 1/16 on.
    static constexpr std::size_t kLimit = 4096;

    void add(double level, std::int64_t milliseconds);

    bool isEmpty() const { return _weights.empty(); }
    double best() const { return _best; }
    double worst() const { return _worst; }
    // Half of the time the level was this or worse.
    double median() const;

    // The members "best", "median", "worst" and "last", null when there was no value.
    void writeJson(JsonWriter& json) const;

private:
    void coarsen();
    double rounded(double level) const;

    std::map<double, std::int64_t> _weights; // ms by level
    double _step = 0;                        // 0: exact
    double _best = 0;
    double _worst = 0;
    double _last = 0;
};

} // namespace orvex
