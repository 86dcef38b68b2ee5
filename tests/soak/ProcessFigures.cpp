#include "ProcessFigures.h"

#include "Expectation.h"

#include "TextFormat.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <span>

namespace orvex::soak {

namespace {
constexpr struct {
    const char* name;
    double ProcessFigures::*figure;
} kFigures[] = {
    {"descriptors", &ProcessFigures::descriptors},
    {"MB", &ProcessFigures::megabytes},
    {"threads", &ProcessFigures::threads},
};

double median(std::span<const ProcessFigures> samples, double ProcessFigures::*figure)
{
    std::vector<double> values;
    for (const ProcessFigures& sample : samples)
        values.push_back(sample.*figure);
    const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
    std::nth_element(values.begin(), middle, values.end());
    return *middle;
}
} // namespace

ProcessFigures ProcessFigures::of(long process)
{
    const std::filesystem::path folder = "/proc/" + std::to_string(process);
    ProcessFigures result;
    const std::filesystem::directory_iterator descriptors(folder / "fd");
    result.descriptors = static_cast<double>(std::distance(begin(descriptors), end(descriptors)));
    std::ifstream status(folder / "status");
    for (std::string word; status >> word;) {
        if (word == "VmRSS:") {
            status >> result.megabytes;
            result.megabytes /= 1024;
        } else if (word == "Threads:") {
            status >> result.threads;
        }
    }
    expect(result.megabytes > 0 && result.threads > 0, "figures in " + folder.string(), result.text());
    return result;
}

std::string ProcessFigures::text() const
{
    return orvex::text("%.0f descriptors, %.1f MB, %.0f threads", descriptors, megabytes, threads);
}

void expectLevel(const std::vector<ProcessFigures>& samples, const ProcessFigures& margins)
{
    expect(samples.size() >= 2, "at least two samples", std::to_string(samples.size()));
    const std::size_t third = std::max<std::size_t>(samples.size() / 3, 1);
    const std::span all(samples);
    for (const auto& [name, figure] : kFigures) {
        const double first = median(all.first(third), figure);
        const double last = median(all.last(third), figure);
        expect(last <= first + margins.*figure,
            text("no more than %.1f %s, %.1f above the median of the first third", first + margins.*figure,
                name, margins.*figure),
            text("a median of %.1f in the last third", last));
    }
}

std::string summaryOf(const std::vector<ProcessFigures>& samples)
{
    std::string result;
    for (const auto& [name, figure] : kFigures) {
        const auto most = std::ranges::max_element(samples, {}, figure);
        result += text("%s%.1f to %.1f %s (at most %.1f)", result.empty() ? "" : ", ",
            samples.front().*figure, samples.back().*figure, name, (*most).*figure);
    }
    return result;
}

} // namespace orvex::soak
