#pragma once

#include <benchmark/benchmark.h>

#include <map>
#include <optional>
#include <set>
#include <string>

namespace orvex::bench {

// Shows benchmarks on the terminal as they end, and keeps their figures: of one that was repeated the median.
class Results final : public benchmark::ConsoleReporter {
public:
    void ReportRuns(const std::vector<Run>& runs) override;

    // Whether it was run, well or not.
    bool hasRun(const std::string& benchmark) const { return _hasRun.contains(benchmark); }
    // None when it was not run, or failed.
    std::optional<double> seconds(const std::string& benchmark) const;
    std::optional<double> counter(const std::string& benchmark, const std::string& name) const;

private:
    struct Figures {
        double seconds;
        std::map<std::string, double> counters;
        bool isMedian;
    };

    std::set<std::string> _hasRun;
    std::map<std::string, Figures> _figures;
};

// The table of all figures that were measured, in Markdown: absolute, as ratios to the floors of the same
// run, and beside their bounds.
std::string markdownTable(const Results& results);

} // namespace orvex::bench
