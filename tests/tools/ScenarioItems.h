#pragma once

#include "scenarios/ScenarioTable.h"

namespace orvex::korat {

inline constexpr Microseconds kStart{1'700'000'000'000'000};

// What a scenario sends in its first time.
inline std::vector<Scenario::Item> itemsOf(
    const ScenarioEntry& entry, Microseconds duration, std::uint64_t seed = 1)
{
    std::vector<Scenario::Item> items;
    const auto scenario = entry.make({seed, kStart});
    for (auto item = scenario->next(); item.due <= duration; item = scenario->next())
        items.push_back(std::move(item));
    return items;
}

} // namespace orvex::korat
