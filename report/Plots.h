#pragma once

#include "ReportPart.h"
#include "ReportRows.h"
#include "Series.h"

#include <map>
#include <string>
#include <unordered_map>
#include <vector>

namespace orvex {

// The member "plots": the series of the rows that the rules name, those with a value ever.
class Plots final : public ReportPart {
public:
    static constexpr std::size_t kMostLines = 64;       // of a plot; of more, those with the lowest peaks go
    static constexpr std::size_t kMostPoints = 200'000; // of a plot, shared equally where it has more

    // `rules` outlive the plots.
    explicit Plots(const std::vector<PlotRule>& rules);

    bool addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text, const Moment& now) override;
    void clear(std::size_t number, const Moment& now) override;
    void finish(const Moment& last) override;
    void writeJson(JsonWriter& json) const override;

private:
    struct Line {
        TimelineRow row;
        SignalRow::Kind kind;
        Series series;
        double peak = 0;
    };
    struct Plot {
        const PlotRule* rule;
        std::vector<std::string> units;    // in the order of appearance
        std::map<std::size_t, Line> lines; // by the number of the row
        std::size_t omitted = 0;
    };

    static void add(Plot& plot, std::size_t number, const std::string* text, const Moment& now);
    static void omitLowest(Plot& plot);
    static void writeLine(JsonWriter& json, const Line& line);

    std::vector<Plot> _plots;
    std::unordered_map<std::size_t, std::vector<std::size_t>> _plotsOfRow; // places by the number of the row
};

} // namespace orvex
