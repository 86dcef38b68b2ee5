#pragma once

#include "LevelStatistics.h"
#include "ReportPart.h"
#include "ReportRows.h"

#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

namespace orvex {

// The cells that a list of neighbours ever showed.
class Neighbours final : public ReportPart {
public:
    static constexpr std::size_t kMostCells = 2'000;

    // `rule` outlives the neighbours.
    explicit Neighbours(const NeighbourRule& rule);

    bool addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text, const Moment& now) override;
    void clear(std::size_t number, const Moment& now) override;
    void finish(const Moment& last) override;
    // An element of the member "neighbours".
    void writeJson(JsonWriter& json) const override;

private:
    struct Cell {
        std::string name;
        std::size_t rowsShown = 0;
        std::size_t samples = 0;    // before `shownSince`
        std::size_t shownSince = 0; // sample
        std::optional<double> level;
        std::int64_t levelSince = 0; // observed ms
        LevelStatistics levels;
        std::string unit;
    };
    struct Row {
        std::size_t cell;
        bool isLevel;
        bool isShown = false;
    };

    void show(Row& row, bool isShown, const Moment& now);
    void takeLevel(Cell& cell, const std::string* text, const Moment& now) const;

    const NeighbourRule& _rule;
    std::string _prefix; // of the paths of its rows
    std::string _levelPath;
    std::vector<Cell> _cells;
    std::unordered_map<std::string, std::size_t> _places; // of the cells, by name
    std::unordered_map<std::size_t, Row> _rows;           // by number
    std::size_t _omitted = 0;                             // rows of cells beyond the limit
};

} // namespace orvex
