#pragma once

#include "Band.h"
#include "LevelStatistics.h"
#include "ReportPart.h"
#include "ReportRows.h"

#include <string>
#include <unordered_map>
#include <vector>

namespace orvex {

// The serving cells of one kind: which one was shown when, how long, and with what levels.
class ServingCells final : public ReportPart {
public:
    static constexpr std::size_t kMostCells = 1'000;

    // `rule` outlives the cells.
    explicit ServingCells(const ServingCellRule& rule);

    bool addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text, const Moment& now) override;
    void clear(std::size_t number, const Moment& now) override;
    void settle(const Moment& before, const Moment& now) override;
    void finish(const Moment& last) override;
    // An element of the member "servingCells".
    void writeJson(JsonWriter& json) const override;
    void writeBand(JsonWriter& json) const;

private:
    struct Cell {
        std::string name;
        std::int64_t duration = 0; // ms, without gaps
        std::size_t visits = 0;
        std::vector<LevelStatistics> levels;
        std::vector<std::string> units;
    };
    struct Row {
        std::string text;
        bool hasChanged = false;
    };

    const std::string& textOf(const char* path) const;
    std::string name() const;
    Cell* cellNamed(const std::string& name);
    void takeLevels(Cell& cell, std::int64_t milliseconds);
    bool isOfServingCell(const CellLevelRow& row) const;

    const ServingCellRule& _rule;
    std::unordered_map<std::string, Row> _rows; // by path, those that matter
    std::unordered_map<std::size_t, Row*> _rowsByNumber;
    std::vector<std::size_t> _sources; // of each level, the place of the row that changed last
    Band _band;
    std::string _current;
    std::vector<Cell> _cells;
    std::unordered_map<std::string, std::size_t> _places; // of the cells, by name
    std::size_t _omitted = 0;                             // visits to cells beyond the limit
    std::int64_t _total = 0;                              // ms observed
};

} // namespace orvex
