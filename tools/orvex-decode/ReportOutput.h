#pragma once

#include "TimelineOutput.h"

#include "ReportSink.h"
#include "WholeFile.h"

#include <chrono>
#include <optional>
#include <string>

namespace orvex {

// A page that shows one capture.
class ReportOutput final : public TimelineOutput {
public:
    // Sets the error if the file cannot be created.
    ReportOutput(std::string path, std::chrono::milliseconds every, std::string& error);

    void begin(const DecodedCapture& capture) override;
    void message(ByteView message, std::chrono::microseconds time) override;
    std::string end(const DecodedCapture& capture) override;

    void sample(Date time) override { _report->sample(time); }
    void addRow(std::size_t number, const TimelineRow& row) override { _report->addRow(number, row); }
    void set(std::size_t number, const std::string& text) override { _report->set(number, text); }
    void clear(std::size_t number) override { _report->clear(number); }

private:
    void write(JsonWriter& json, const DecodedCapture& capture) const;

    std::string _path;
    std::chrono::milliseconds _every;
    WholeFile _file;
    std::optional<ReportSink> _report;
};

} // namespace orvex
