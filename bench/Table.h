#pragma once

#include <benchmark/benchmark.h>

#include <map>
#include <optional>
#include <set>
#include <string>

namespace orvex::bench {

// Prints benchmarks as they end and keeps their figures, the median of repetitions.
class Results final : public benchmark::ConsoleReporter {
public:
    void ReportRuns(const std::vector<Run>& runs) override;

    // True even if it failed.
    bool hasRun(const std::string& benchmark) const { return _hasRun.contains(benchmark); }
    // None if it was not run or failed.
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

// The Markdown table of all figures: absolute, relative to the floors of the same run, and beside their
// bounds.
std::string markdownTable(const Results& results);

} // namespace orvex::bench
