#include "Plots.h"

#include <algorithm>

namespace orvex {

Plots::Plots(const std::vector<PlotRule>& rules)
{
    for (const PlotRule& rule : rules)
        _plots.push_back({.rule = &rule, .units = {}, .lines = {}});
}

bool Plots::addRow(std::size_t number, const TimelineRow& row)
{
    bool isFollowed = false;
    for (std::size_t place = 0; place < _plots.size(); ++place) {
        const auto& rows = _plots[place].rule->rows;
        const auto signal = std::ranges::find_if(
            rows, [&](const SignalRow& candidate) { return matches(candidate.path, row.path); });
        if (signal == rows.end())
            continue;
        _plots[place].lines.emplace(number, Line{.row = row, .kind = signal->kind, .series = {}});
        _plotsOfRow[number].push_back(place);
        isFollowed = true;
    }
    return isFollowed;
}

void Plots::set(std::size_t number, const std::string& text, const Moment& now)
{
    for (const std::size_t place : _plotsOfRow[number])
        add(_plots[place], number, &text, now);
}

void Plots::clear(std::size_t number, const Moment& now)
{
    for (const std::size_t place : _plotsOfRow[number])
        add(_plots[place], number, nullptr, now);
}

void Plots::add(Plot& plot, std::size_t number, const std::string* text, const Moment& now)
{
    const auto found = plot.lines.find(number);
    if (found == plot.lines.end())
        return; // left out
    Line& line = found->second;
    const auto value = text ? signalValueOf(*text, line.kind) : std::nullopt;
    const bool isFirst = line.series.points().empty();
    line.series.add(now.position, value ? std::optional(value->number) : std::nullopt);
    if (!value)
        return;
    line.peak = isFirst ? value->number : std::max(line.peak, value->number);
    if (std::ranges::find(plot.units, value->unit) == plot.units.end())
        plot.units.push_back(value->unit);
    if (isFirst && plot.lines.size() > kMostLines)
        omitLowest(plot);
}

void Plots::omitLowest(Plot& plot)
{
    const auto hasValue = [](const auto& entry) { return !entry.second.series.points().empty(); };
    if (std::ranges::count_if(plot.lines, hasValue) <= static_cast<std::ptrdiff_t>(kMostLines))
        return;
    auto lowest = plot.lines.end();
    for (auto line = plot.lines.begin(); line != plot.lines.end(); ++line) {
        if (hasValue(*line) && (lowest == plot.lines.end() || line->second.peak < lowest->second.peak))
            lowest = line;
    }
    plot.lines.erase(lowest);
    ++plot.omitted;
}

void Plots::finish(const Moment& /*last*/)
{
    for (Plot& plot : _plots) {
        std::erase_if(plot.lines, [](const auto& entry) { return entry.second.series.points().empty(); });
        std::size_t points = 0;
        for (auto& [number, line] : plot.lines) {
            line.series.finish();
            points += line.series.points().size();
        }
        if (points <= kMostPoints)
            continue;
        for (auto& [number, line] : plot.lines)
            line.series.finish(kMostPoints / plot.lines.size());
    }
}

void Plots::writeJson(JsonWriter& json) const
{
    json.key("plots");
    json.beginArray();
    for (const Plot& plot : _plots) {
        if (plot.lines.empty())
            continue;
        std::string units;
        for (const std::string& unit : plot.units)
            units += (units.empty() ? "" : ", ") + unit;
        json.beginObject();
        json.member("title", plot.rule->title);
        json.member("unit", units);
        json.key("fromZero");
        json.boolean(plot.rule->isFromZero);
        json.member("omitted", plot.omitted);
        json.key("lines");
        json.beginArray();
        for (const auto& [number, line] : plot.lines)
            writeLine(json, line);
        json.endArray();
        json.endObject();
    }
    json.endArray();
}

void Plots::writeLine(JsonWriter& json, const Line& line)
{
    json.beginObject();
    json.member("path", line.row.path);
    json.member("key", line.row.key);
    line.series.writeJson(json);
    json.endObject();
}

} // namespace orvex
