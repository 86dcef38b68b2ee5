#pragma once

#include "Contexts.h"
#include "Neighbours.h"
#include "Plots.h"
#include "ReportClock.h"
#include "ReportPart.h"
#include "ReportRows.h"
#include "ServingCells.h"
#include "States.h"
#include "TimelineSink.h"

#include <chrono>
#include <memory>
#include <string_view>
#include <vector>

namespace orvex {

// Gathers the parts of a report from a timeline. Its memory has a limit, however long the capture is.
class ReportSink final : public TimelineSink {
public:
    explicit ReportSink(std::string_view technology);

    // Every message of the capture that has a time, before the samples that follow it.
    void takeMessage(std::chrono::microseconds time) { _clock.takeMessage(time); }

    void sample(Date time) override;
    void addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text) override;
    void clear(std::size_t number) override;
    // After the last sample.
    void finish();

    // Members of the report.
    void writeJson(JsonWriter& json) const;

private:
    const ReportRows& _rules;
    ReportClock _clock;
    Plots _plots;
    States _states;
    Contexts _contexts;
    std::vector<std::unique_ptr<ServingCells>> _servingCells;
    std::vector<std::unique_ptr<Neighbours>> _neighbours;
    std::vector<ReportPart*> _parts;                   // all of these
    std::vector<std::vector<ReportPart*>> _partsOfRow; // by the number of the row
};

} // namespace orvex
