#include "Neighbours.h"

namespace orvex {

Neighbours::Neighbours(const NeighbourRule& rule)
    : _rule(rule)
    , _prefix(std::string(rule.list) + "/*")
    , _levelPath(rule.level == std::string_view("*") ? _prefix : _prefix + '/' + rule.level)
{
}

bool Neighbours::addRow(std::size_t number, const TimelineRow& row)
{
    if (row.path != _prefix && !row.path.starts_with(_prefix + '/'))
        return false;
    auto found = _places.find(row.key);
    if (found == _places.end()) {
        if (_cells.size() == kMostCells) {
            if (row.path == _levelPath)
                ++_omitted;
            return false;
        }
        found = _places.emplace(row.key, _cells.size()).first;
        _cells.push_back({.name = row.key, .level = std::nullopt, .levels = {}, .unit = {}});
    }
    _rows[number] = {.cell = found->second, .isLevel = row.path == _levelPath};
    return true;
}

void Neighbours::set(std::size_t number, const std::string& text, const Moment& now)
{
    Row& row = _rows.at(number);
    show(row, true, now);
    if (row.isLevel)
        takeLevel(_cells[row.cell], &text, now);
}

void Neighbours::clear(std::size_t number, const Moment& now)
{
    Row& row = _rows.at(number);
    show(row, false, now);
    if (row.isLevel)
        takeLevel(_cells[row.cell], nullptr, now);
}

void Neighbours::show(Row& row, bool isShown, const Moment& now)
{
    if (row.isShown == isShown)
        return;
    row.isShown = isShown;
    Cell& cell = _cells[row.cell];
    if (isShown && cell.rowsShown++ == 0)
        cell.shownSince = now.sample;
    else if (!isShown && --cell.rowsShown == 0)
        cell.samples += now.sample - cell.shownSince;
}

void Neighbours::takeLevel(Cell& cell, const std::string* text, const Moment& now) const
{
    if (cell.level)
        cell.levels.add(*cell.level, now.observed - cell.levelSince);
    cell.level.reset();
    cell.levelSince = now.observed;
    if (const auto value = text ? signalValueOf(*text, _rule.kind) : std::nullopt) {
        cell.level = value->number;
        cell.unit = value->unit;
    }
}

void Neighbours::finish(const Moment& last)
{
    for (Cell& cell : _cells) {
        takeLevel(cell, nullptr, last);
        if (cell.rowsShown > 0)
            cell.samples += last.sample + 1 - cell.shownSince;
    }
}

void Neighbours::writeJson(JsonWriter& json) const
{
    json.beginObject();
    json.member("title", _rule.title);
    json.member("level", _rule.level == std::string_view("*") ? "Level" : _rule.level);
    json.member("omitted", _omitted);
    json.key("cells");
    json.beginArray();
    for (const Cell& cell : _cells) {
        json.beginObject();
        json.member("name", cell.name);
        json.member("samples", cell.samples);
        json.member("unit", cell.unit);
        cell.levels.writeJson(json);
        json.endObject();
    }
    json.endArray();
    json.endObject();
}

} // namespace orvex
