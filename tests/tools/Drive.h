#pragma once

#include "ScenarioItems.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace orvex::korat {

// Between which bounds the least and the most of a measure are expected.
struct Range {
    const char* measure;
    std::pair<double, double> least;
    std::pair<double, double> most;
};

// What is seen on a drive: the least and the most of each measure, and all values of others.
class Drive {
public:
    void note(const char* measure, double value)
    {
        auto& [least, most] = ranges.try_emplace(measure, value, value).first->second;
        least = std::min(least, value);
        most = std::max(most, value);
    }

    void expectRanges(const std::vector<Range>& expected) const
    {
        for (const auto& [measure, least, most] : expected) {
            ASSERT_TRUE(ranges.contains(measure)) << measure;
            const auto& [actualLeast, actualMost] = ranges.at(measure);
            EXPECT_TRUE(least.first <= actualLeast && actualLeast <= least.second)
                << measure << ' ' << actualLeast;
            EXPECT_TRUE(most.first <= actualMost && actualMost <= most.second)
                << measure << ' ' << actualMost;
        }
    }

    std::map<std::string, std::pair<double, double>> ranges;
    std::map<std::string, std::set<int>> kinds;
};

} // namespace orvex::korat
