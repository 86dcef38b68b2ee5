#pragma once

#include "Date.h"

#include <cstddef>
#include <string>

namespace orvex {

// A row of the display followed over time. Rows of a list are told apart by what they show, not by their
// place.
struct TimelineRow {
    // As in the display tree, with "*" for each place in a list: "/Neighbor Cells List/*/Measured RSRP".
    std::string path;
    // What identifies the list elements that the row is in, the outermost first: "Physical Cell ID 95,
    // E-ARFCN 1300". Their places where nothing does ("2"). Empty outside of lists. Unique with the path.
    std::string key;
};

// Takes what a timeline finds, in the order of the capture.
class TimelineSink {
public:
    virtual ~TimelineSink() = default;

    // The display was looked at; what has changed since the last time follows.
    virtual void sample(Date time) = 0;
    // A row is shown that never was before. Numbers count from 0 without gaps.
    virtual void addRow(std::size_t number, const TimelineRow& row) = 0;
    // The row shows another text, or is shown again.
    virtual void set(std::size_t number, const std::string& text) = 0;
    // The row is no longer shown.
    virtual void clear(std::size_t number) = 0;
};

} // namespace orvex
