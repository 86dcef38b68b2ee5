#include "Results.h"

namespace orvex::bench {

void Results::ReportRuns(const std::vector<Run>& runs)
{
    ConsoleReporter::ReportRuns(runs);
    for (const Run& run : runs) {
        const std::string& name = run.run_name.function_name;
        _hasRun.insert(name);
        const bool isMedian = run.run_type == Run::RT_Aggregate && run.aggregate_name == "median";
        if (run.error_occurred || (run.run_type == Run::RT_Aggregate && !isMedian))
            continue;
        if (const auto known = _figures.find(name); known != _figures.end() && known->second.isMedian)
            continue;
        // What is of one thread is told in processor time, whatever else the machine does.
        const double time =
            run.run_name.time_type.empty() ? run.GetAdjustedCPUTime() : run.GetAdjustedRealTime();
        Figures figures{time / benchmark::GetTimeUnitMultiplier(run.time_unit), {}, isMedian};
        for (const auto& [counter, value] : run.counters)
            figures.counters[counter] = value;
        _figures[name] = std::move(figures);
    }
}

std::optional<double> Results::seconds(const std::string& benchmark) const
{
    const auto found = _figures.find(benchmark);
    return found == _figures.end() ? std::nullopt : std::optional(found->second.seconds);
}

std::optional<double> Results::counter(const std::string& benchmark, const std::string& name) const
{
    const auto found = _figures.find(benchmark);
    if (found == _figures.end() || !found->second.counters.contains(name))
        return std::nullopt;
    return found->second.counters.at(name);
}

} // namespace orvex::bench
