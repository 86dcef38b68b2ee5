#include "Table.h"

#include "TextFormat.h"

#include <QString>

#include <algorithm>
#include <cmath>

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
        // Single-threaded figures are in processor time, which other load does not change.
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

namespace {

enum class Unit { perSecond, milliseconds, microseconds, mebibytes, percent };

// A measured figure: a benchmark's time or one of its counters.
struct Figure {
    const char* benchmark;
    const char* counter; // null for the time
};

// The bound of a figure: a value, or a multiple of another figure.
struct Bound {
    enum class Kind { none, atLeast, atMost } kind = Kind::none;
    double factor = 0;
    Figure of = {nullptr, nullptr}; // none: the factor is the bound itself
};

struct Row {
    const char* what;
    Unit unit;
    Figure figure;
    const char* copyFloor = nullptr; // floor to compare with
    Bound bound = {};
};

constexpr const char* kRate = "messages/s";
constexpr const char* kPeak = "peak MiB";
constexpr const char* kPrintFloor = "print";

constexpr Bound atLeast(double factor, Figure of = {nullptr, nullptr})
{
    return {Bound::Kind::atLeast, factor, of};
}
constexpr Bound atMost(double factor, Figure of = {nullptr, nullptr})
{
    return {Bound::Kind::atMost, factor, of};
}
constexpr Bound kDecodeBound = atLeast(1.5, {kPrintFloor, kRate});

constexpr Bound timelineBound(const char* plain)
{
    return atMost(2, {plain, nullptr});
}

constexpr Row kRows[] = {
    {"floor: copy, LTE", Unit::perSecond, {"copy/lte", kRate}},
    {"floor: copy, UTRAN", Unit::perSecond, {"copy/utran", kRate}},
    {"floor: copy, GSM/UMTS", Unit::perSecond, {"copy/gsm", kRate}},
    {"floor: copy, CDMA2000", Unit::perSecond, {"copy/cdma", kRate}},
    {"floor: copy, IFX", Unit::perSecond, {"copy/ifx", kRate}},
    {"floor: print", Unit::perSecond, {kPrintFloor, kRate}},

    {"decode LTE", Unit::perSecond, {"decode/lte", kRate}, "copy/lte", kDecodeBound},
    {"decode UTRAN", Unit::perSecond, {"decode/utran", kRate}, "copy/utran", kDecodeBound},
    {"decode GSM/UMTS", Unit::perSecond, {"decode/gsm", kRate}, "copy/gsm", kDecodeBound},
    {"decode CDMA2000", Unit::perSecond, {"decode/cdma", kRate}, "copy/cdma", kDecodeBound},
    {"decode LTE, baseband packets", Unit::perSecond, {"baseband/lte", kRate}, "copy/lte", kDecodeBound},
    {"decode UTRAN, baseband packets", Unit::perSecond, {"baseband/utran", kRate}, "copy/utran",
        kDecodeBound},
    {"decode GSM/UMTS, baseband packets", Unit::perSecond, {"baseband/gsm", kRate}, "copy/gsm", kDecodeBound},
    {"decode IFX", Unit::perSecond, {"decode/ifx", kRate}, "copy/ifx", kDecodeBound},

    {"decode LTE, log file", Unit::perSecond, {"decode+file/lte", kRate}, "copy/lte",
        atLeast(1.0 / 3, {"decode/lte", kRate})},
    {"decode UTRAN, log file", Unit::perSecond, {"decode+file/utran", kRate}, "copy/utran",
        atLeast(1.0 / 3, {"decode/utran", kRate})},
    {"decode GSM/UMTS, log file", Unit::perSecond, {"decode+file/gsm", kRate}, "copy/gsm",
        atLeast(1.0 / 3, {"decode/gsm", kRate})},
    {"decode CDMA2000, log file", Unit::perSecond, {"decode+file/cdma", kRate}, "copy/cdma",
        atLeast(1.0 / 3, {"decode/cdma", kRate})},
    {"decode IFX, log file", Unit::perSecond, {"decode+file/ifx", kRate}, "copy/ifx",
        atLeast(1.0 / 3, {"decode/ifx", kRate})},

    {"decode LTE, baseband packets, log file", Unit::perSecond, {"baseband+file/lte", kRate}, "copy/lte",
        atLeast(1.0 / 3, {"baseband/lte", kRate})},
    {"decode UTRAN, baseband packets, log file", Unit::perSecond, {"baseband+file/utran", kRate},
        "copy/utran", atLeast(1.0 / 3, {"baseband/utran", kRate})},
    {"decode GSM/UMTS, baseband packets, log file", Unit::perSecond, {"baseband+file/gsm", kRate}, "copy/gsm",
        atLeast(1.0 / 3, {"baseband/gsm", kRate})},
    {"decode LTE, log queue", Unit::perSecond, {"decode+queue/lte", kRate}, "copy/lte",
        atLeast(1.0 / 3, {"decode/lte", kRate})},
    {"— lines that were not dropped", Unit::percent, {"decode+queue/lte", "kept %"}},
    {"decode UTRAN, log queue", Unit::perSecond, {"decode+queue/utran", kRate}, "copy/utran",
        atLeast(1.0 / 3, {"decode/utran", kRate})},
    {"— lines that were not dropped", Unit::percent, {"decode+queue/utran", "kept %"}},
    {"decode GSM/UMTS, log queue", Unit::perSecond, {"decode+queue/gsm", kRate}, "copy/gsm",
        atLeast(1.0 / 3, {"decode/gsm", kRate})},
    {"— lines that were not dropped", Unit::percent, {"decode+queue/gsm", "kept %"}},
    {"decode CDMA2000, log queue", Unit::perSecond, {"decode+queue/cdma", kRate}, "copy/cdma",
        atLeast(1.0 / 3, {"decode/cdma", kRate})},
    {"— lines that were not dropped", Unit::percent, {"decode+queue/cdma", "kept %"}},
    {"decode IFX, log queue", Unit::perSecond, {"decode+queue/ifx", kRate}, "copy/ifx",
        atLeast(1.0 / 3, {"decode/ifx", kRate})},
    {"— lines that were not dropped", Unit::percent, {"decode+queue/ifx", "kept %"}},

    {"ten hours of LTE", Unit::milliseconds, {"hours/lte", nullptr}},
    {"— followed over time", Unit::milliseconds, {"hours+timeline/lte", nullptr}, nullptr,
        timelineBound("hours/lte")},
    {"ten hours of UTRAN", Unit::milliseconds, {"hours/utran", nullptr}},
    {"— followed over time", Unit::milliseconds, {"hours+timeline/utran", nullptr}, nullptr,
        timelineBound("hours/utran")},
    {"ten hours of GSM/UMTS", Unit::milliseconds, {"hours/gsm", nullptr}},
    {"— followed over time", Unit::milliseconds, {"hours+timeline/gsm", nullptr}, nullptr,
        timelineBound("hours/gsm")},
    {"ten hours of CDMA2000", Unit::milliseconds, {"hours/cdma", nullptr}},
    {"— followed over time", Unit::milliseconds, {"hours+timeline/cdma", nullptr}, nullptr,
        timelineBound("hours/cdma")},
    {"ten hours of IFX", Unit::milliseconds, {"hours/ifx", nullptr}},
    {"— followed over time", Unit::milliseconds, {"hours+timeline/ifx", nullptr}, nullptr,
        timelineBound("hours/ifx")},

    {"dictionary of 100,000 random keys", Unit::milliseconds, {"dictionary/random", nullptr}},
    {"— of keys that collide in std::hash", Unit::milliseconds, {"dictionary/chosen", nullptr}, nullptr,
        atMost(4, {"dictionary/random", nullptr})},

    {"rebuild the tree, LTE", Unit::microseconds, {"rebuild/lte", nullptr}},
    {"rebuild the tree, UTRAN", Unit::microseconds, {"rebuild/utran", nullptr}},
    {"rebuild the tree, GSM/UMTS", Unit::microseconds, {"rebuild/gsm", nullptr}},
    {"rebuild the tree, CDMA2000", Unit::microseconds, {"rebuild/cdma", nullptr}},
    {"rebuild the tree, IFX", Unit::microseconds, {"rebuild/ifx", nullptr}},
    {"rebuild the fullest tree, GSM/UMTS", Unit::microseconds, {"rebuild/fullest", nullptr}, nullptr,
        atMost(150e-6)},

    {"refresh to painted, 64 rows", Unit::milliseconds, {"paint/handset", nullptr}, nullptr, atMost(8e-3)},
    {"— all of them in view", Unit::milliseconds, {"paint/all rows", nullptr}, nullptr, atMost(8e-3)},
    {"start to first window painted", Unit::milliseconds, {"start/alone", nullptr}, nullptr, atMost(150e-3)},
    {"— beside a service that answers", Unit::milliseconds, {"start/service", nullptr}, nullptr,
        atMost(150e-3)},

    {"message port, process to decoded", Unit::perSecond, {"port/decoded", kRate}, "copy/lte",
        atLeast(200e3)},
    {"— without the decoding", Unit::perSecond, {"port/alone", kRate}, "copy/lte"},
    {"— median latency when idle", Unit::microseconds, {"port/idle", nullptr}, nullptr, atMost(100e-6)},

    {"orvex-decode, large capture", Unit::perSecond, {"offline/large", kRate}, "copy/lte", atLeast(1e6)},
    {"— most memory it held", Unit::mebibytes, {"offline/large", kPeak}, nullptr,
        atMost(1.1, {"offline/small", kPeak})},
    {"orvex-decode, baseband packets, 64 MiB", Unit::perSecond, {"offline/baseband", kRate}, "copy/lte",
        atLeast(1e6)},
    {"orvex-decode, capture of 64 MiB", Unit::perSecond, {"offline/small", kRate}, "copy/lte", atLeast(1e6)},
    {"— most memory it held", Unit::mebibytes, {"offline/small", kPeak}},
};

std::optional<double> valueOf(const Results& results, const Figure& figure)
{
    return figure.counter ? results.counter(figure.benchmark, figure.counter)
                          : results.seconds(figure.benchmark);
}

// Three significant digits.
std::string digits(double value)
{
    const int decimals =
        value <= 0 ? 0 : std::clamp(2 - static_cast<int>(std::floor(std::log10(value))), 0, 3);
    return QString::number(value, 'f', decimals).toStdString();
}

std::string textOf(double value, Unit unit)
{
    switch (unit) {
    case Unit::perSecond: return value >= 1e6 ? digits(value / 1e6) + " M/s" : digits(value / 1e3) + " k/s";
    case Unit::milliseconds: return digits(value * 1e3) + " ms";
    case Unit::microseconds: return digits(value * 1e6) + " µs";
    case Unit::mebibytes: return digits(value) + " MiB";
    case Unit::percent: return digits(value) + " %";
    }
    return {};
}

// A rate divided by the floor's, or a time in messages of the floor.
std::string ratioTo(const Results& results, const char* floor, double value, Unit unit)
{
    const auto rate = floor ? results.counter(floor, kRate) : std::nullopt;
    if (!rate)
        return {};
    if (unit == Unit::perSecond)
        return digits(value / *rate) + " ×";
    if (unit == Unit::milliseconds || unit == Unit::microseconds)
        return text("%.0f msg", value * *rate);
    return {};
}

struct Verdict {
    std::string bound;
    const char* isMet;
};

Verdict verdictOn(const Results& results, const Row& row, double value)
{
    const Bound& bound = row.bound;
    const auto base = bound.of.benchmark ? valueOf(results, bound.of) : std::optional(1.0);
    if (bound.kind == Bound::Kind::none || !base)
        return {"", ""};
    const double limit = bound.factor * *base;
    const bool isLowest = bound.kind == Bound::Kind::atLeast;
    return {(isLowest ? "≥ " : "≤ ") + textOf(limit, row.unit),
        (isLowest ? value >= limit : value <= limit) ? "yes" : "**no**"};
}

} // namespace

std::string markdownTable(const Results& results)
{
    std::string table = "| what | figure | of copy | of print | bound | met |\n|---|--:|--:|--:|--:|---|\n";
    for (const Row& row : kRows) {
        if (!results.hasRun(row.figure.benchmark))
            continue;
        const auto value = valueOf(results, row.figure);
        if (!value) {
            table += text("| %s | failed | | | | |\n", row.what);
            continue;
        }
        const auto [bound, isMet] = verdictOn(results, row, *value);
        table += text("| %s | %s | %s | %s | %s | %s |\n", row.what, textOf(*value, row.unit).c_str(),
            ratioTo(results, row.copyFloor, *value, row.unit).c_str(),
            ratioTo(results, kPrintFloor, *value, row.unit).c_str(), bound.c_str(), isMet);
    }
    return table;
}

} // namespace orvex::bench
