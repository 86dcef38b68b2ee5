#pragma once

#include "TreeJson.h"

#include <cstdint>
#include <optional>
#include <vector>

namespace orvex {

// A value over time, in bounded memory: up to 20,000 changes as they are. A longer series is thinned to
// buckets of equal length, of which each keeps its highest, its lowest and its last value, and whether it was
// ever absent. Peaks stay, and so does what holds until the next bucket.
class Series {
public:
    static constexpr std::size_t kLimit = 20'000;

    struct Point {
        std::int64_t position;        // when the value changed
        std::optional<double> number; // none when there is no value from here on

        friend bool operator==(const Point&, const Point&) = default;
    };

    // Positions do not decrease. Of several values at one position the last one holds.
    void add(std::int64_t position, std::optional<double> number);
    // Before it is written: thins it to so many points, if it has more.
    void finish(std::size_t limit = kLimit);

    const std::vector<Point>& points() const { return _points; }
    // Length of the buckets in ms; 0 while nothing was thinned.
    std::int64_t bucket() const { return _bucket; }

    // The members "steps" (ms since the point before; the first since 1970) and "numbers" and, of a thinned
    // series, "bucket".
    void writeJson(JsonWriter& json) const;

private:
    void widen(std::size_t limit);
    void thin();

    std::vector<Point> _points;
    std::int64_t _bucket = 0;
};

} // namespace orvex
