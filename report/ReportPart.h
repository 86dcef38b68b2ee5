#pragma once

#include "Moment.h"
#include "TimelineSink.h"
#include "TreeJson.h"

#include <cstddef>
#include <string>

namespace orvex {

// A part of a report, which gathers what it shows from the rows it follows.
class ReportPart {
public:
    virtual ~ReportPart() = default;

    // Returns whether the part follows the row. Only then it is told what the row shows.
    virtual bool addRow(std::size_t number, const TimelineRow& row) = 0;
    virtual void set(std::size_t number, const std::string& text, const Moment& now) = 0;
    virtual void clear(std::size_t number, const Moment& now) = 0;
    // What was told since the last time is complete, and held from `before` to `now`.
    virtual void settle(const Moment& /*before*/, const Moment& /*now*/) { }
    // The capture has ended.
    virtual void finish(const Moment& /*last*/) { }
    // Members of the report.
    virtual void writeJson(JsonWriter& json) const = 0;
};

} // namespace orvex
