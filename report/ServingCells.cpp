#include "ServingCells.h"

#include <algorithm>

namespace orvex {

ServingCells::ServingCells(const ServingCellRule& rule)
    : _rule(rule)
    , _sources(rule.levels.size())
    , _band(rule.title, true)
{
    const auto follow = [this](const char* path) {
        if (path)
            _rows.try_emplace(path);
    };
    for (const CellNamePart& part : rule.name) {
        follow(part.path);
        follow(part.alternative);
    }
    for (const CellLevel& level : rule.levels) {
        for (const CellLevelRow& row : level.rows) {
            follow(row.path);
            follow(row.cellPath);
        }
    }
}

bool ServingCells::addRow(std::size_t number, const TimelineRow& row)
{
    const auto found = _rows.find(row.path);
    if (found == _rows.end() || !row.key.empty())
        return false;
    _rowsByNumber[number] = &found->second;
    return true;
}

void ServingCells::set(std::size_t number, const std::string& text, const Moment& /*now*/)
{
    *_rowsByNumber.at(number) = {isBlank(text) ? "" : text, true};
}

void ServingCells::clear(std::size_t number, const Moment& now)
{
    set(number, "", now);
}

void ServingCells::settle(const Moment& before, const Moment& now)
{
    const std::int64_t milliseconds = now.observed - before.observed;
    _total += milliseconds;
    const std::string name = this->name();
    _band.add(before.position, name);
    Cell* cell = name.empty() ? nullptr : cellNamed(name);
    if (name != _current) {
        _current = name;
        if (cell)
            ++cell->visits;
        else if (!name.empty())
            ++_omitted;
    }
    if (cell) {
        cell->duration += milliseconds;
        takeLevels(*cell, milliseconds);
    }
    for (auto& [path, row] : _rows)
        row.hasChanged = false;
}

void ServingCells::finish(const Moment& last)
{
    settle(last, last);
    _band.finish();
}

const std::string& ServingCells::textOf(const char* path) const
{
    return _rows.at(path).text;
}

// Empty while the first part is not shown.
std::string ServingCells::name() const
{
    std::string result;
    for (const CellNamePart& part : _rule.name) {
        const std::string* text = &textOf(part.path);
        if (text->empty() && part.alternative)
            text = &textOf(part.alternative);
        if (text->empty() && result.empty())
            return {};
        if (text->empty())
            continue;
        const std::string label = part.label;
        result += (result.empty() ? "" : ", ") + label + (label.empty() ? "" : " ") + *text;
    }
    return result;
}

ServingCells::Cell* ServingCells::cellNamed(const std::string& name)
{
    if (const auto found = _places.find(name); found != _places.end())
        return &_cells[found->second];
    if (_cells.size() == kMostCells)
        return nullptr;
    _places[name] = _cells.size();
    const std::size_t levels = _rule.levels.size();
    _cells.push_back({.name = name,
        .levels = std::vector<LevelStatistics>(levels),
        .units = std::vector<std::string>(levels)});
    return &_cells.back();
}

void ServingCells::takeLevels(Cell& cell, std::int64_t milliseconds)
{
    for (std::size_t i = 0; i < _rule.levels.size(); ++i) {
        const std::vector<CellLevelRow>& rows = _rule.levels[i].rows;
        for (std::size_t source = 0; source < rows.size(); ++source) {
            if (_rows.at(rows[source].path).hasChanged && isOfServingCell(rows[source]))
                _sources[i] = source;
        }
        const CellLevelRow& row = rows[_sources[i]];
        const auto value = signalValueOf(textOf(row.path), SignalRow::Kind::quantity);
        if (!value || !isOfServingCell(row))
            continue;
        cell.levels[i].add(value->number, milliseconds);
        cell.units[i] = value->unit;
    }
}

bool ServingCells::isOfServingCell(const CellLevelRow& row) const
{
    return !row.cellPath || textOf(row.cellPath) == textOf(_rule.name.front().path);
}

void ServingCells::writeBand(JsonWriter& json) const
{
    if (!_band.isEmpty())
        _band.writeJson(json);
}

void ServingCells::writeJson(JsonWriter& json) const
{
    json.beginObject();
    json.member("title", _rule.title);
    json.member("omitted", _omitted);
    json.key("levels");
    json.beginArray();
    for (const CellLevel& level : _rule.levels)
        json.string(level.name);
    json.endArray();
    json.key("cells");
    json.beginArray();
    for (const Cell& cell : _cells) {
        json.beginObject();
        json.member("name", cell.name);
        json.member("duration", static_cast<std::size_t>(cell.duration));
        json.key("share");
        json.number(_total == 0 ? 0.0 : static_cast<double>(cell.duration) / static_cast<double>(_total));
        json.member("visits", cell.visits);
        json.key("levels");
        json.beginArray();
        for (std::size_t i = 0; i < cell.levels.size(); ++i) {
            json.beginObject();
            json.member("unit", cell.units[i]);
            cell.levels[i].writeJson(json);
            json.endObject();
        }
        json.endArray();
        json.endObject();
    }
    json.endArray();
    json.endObject();
}

} // namespace orvex
