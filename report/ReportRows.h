#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace orvex {

// Which rows of a technology's display a report follows. Paths are those of a timeline; "*" stands for one
// component.

// A row that is plotted.
struct SignalRow {
    enum class Kind {
        quantity, // a number with a unit; a remark in front is skipped: "(ref pilot) -7.95 dB"
        bare,     // a number without a unit
    };

    const char* path;
    Kind kind = Kind::quantity;
};

// Rows that share a plot.
struct PlotRule {
    const char* title;
    std::vector<SignalRow> rows;
    bool isFromZero = false;
};

// What the serving cell is called: the texts of rows, each after its label. A row that is not shown is
// replaced by its alternative.
struct CellNamePart {
    const char* label;
    const char* path;
    const char* alternative = nullptr;
};

// A level of the serving cell. Where a report names its cell, it counts for the serving one only while that
// row shows the same as the first part of the cell's name.
struct CellLevelRow {
    const char* path;
    const char* cellPath = nullptr;
};
struct CellLevel {
    const char* name;
    std::vector<CellLevelRow> rows; // the one that changed last counts
};

struct ServingCellRule {
    const char* title;
    std::vector<CellNamePart> name;
    std::vector<CellLevel> levels;
};

// A row whose texts are states.
struct StateRule {
    const char* title;
    const char* path;
};

struct NeighbourRule {
    const char* title;
    const char* list;  // its path
    const char* level; // name of a row of its elements; empty for none
    SignalRow::Kind kind = SignalRow::Kind::quantity;
};

struct ReportRows {
    const char* technologyName;
    std::vector<ServingCellRule> servingCells;
    std::vector<StateRule> states;
    std::vector<PlotRule> plots;
    std::vector<NeighbourRule> neighbours;
    const char* contexts; // path of an element's rows; empty when the technology has none
};

// `technology` as in TelephonyConstants.h.
const ReportRows& reportRowsOf(std::string_view technology);

bool matches(std::string_view pattern, std::string_view path);
// True for the texts of rows that show nothing: "", "N/A" and the dash of templates.
bool isBlank(std::string_view text);

struct SignalValue {
    double number;
    std::string unit;
};
std::optional<SignalValue> signalValueOf(std::string_view text, SignalRow::Kind kind);

} // namespace orvex
