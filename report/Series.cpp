#include "Series.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <span>

namespace orvex {

namespace {

using Point = Series::Point;

// Appends what a bucket keeps.
void keep(std::span<const Point> bucket, std::vector<Point>& kept)
{
    const Point* lowest = nullptr;
    const Point* highest = nullptr;
    const Point* absent = nullptr;
    for (const Point& point : bucket) {
        if (!point.number) {
            absent = absent ? absent : &point;
            continue;
        }
        if (!lowest || *point.number < *lowest->number)
            lowest = &point;
        if (!highest || *point.number > *highest->number)
            highest = &point;
    }
    std::array<const Point*, 4> points{lowest, highest, absent, &bucket.back()};
    std::ranges::sort(points);
    const auto* const end = std::unique(points.begin(), points.end());
    for (const auto* point = points.begin(); point != end; ++point) {
        if (*point)
            kept.push_back(**point);
    }
}

} // namespace

void Series::add(std::int64_t position, std::optional<double> number)
{
    if (!number && (_points.empty() || !_points.back().number))
        return;
    _points.push_back({position, number});
    if (_points.size() > kLimit)
        widen(kLimit);
}

void Series::finish(std::size_t limit)
{
    if (_bucket != 0)
        thin(); // what came after the last time has all its points
    if (_points.size() > limit)
        widen(limit);
}

// At most four points of each bucket stay, so that a fifth of the limit is free again. Buckets double, so
// that what a bucket keeps is in the one that takes its place.
void Series::widen(std::size_t limit)
{
    const auto buckets = std::max<std::int64_t>(static_cast<std::int64_t>(limit) / 5, 1);
    const std::int64_t length = _points.back().position - _points.front().position + 1;
    if (_bucket == 0)
        _bucket = (length + buckets - 1) / buckets;
    while (_bucket * buckets < length)
        _bucket *= 2;
    thin();
}

void Series::thin()
{
    std::vector<Point> kept;
    kept.reserve(kLimit);
    for (auto first = _points.cbegin(); first != _points.cend();) {
        const std::int64_t number = first->position / _bucket;
        const auto end = std::find_if(
            first, _points.cend(), [&](const Point& point) { return point.position / _bucket != number; });
        keep({first, end}, kept);
        first = end;
    }
    _points = std::move(kept);
}

void Series::writeJson(JsonWriter& json) const
{
    if (_bucket != 0)
        json.member("bucket", static_cast<std::size_t>(_bucket));
    json.key("steps");
    json.beginArray();
    std::int64_t before = 0;
    for (const Point& point : _points) {
        json.number(static_cast<std::size_t>(point.position - before));
        before = point.position;
    }
    json.endArray();
    json.key("numbers");
    json.beginArray();
    for (const Point& point : _points) {
        if (point.number)
            json.number(*point.number);
        else
            json.null();
    }
    json.endArray();
}

} // namespace orvex
