#pragma once

#include "TimelineOutput.h"

#include "TimelineCsv.h"
#include "WholeFile.h"

#include <optional>
#include <string>

namespace orvex {

// The timeline of one capture as comma-separated values.
class CsvOutput final : public TimelineOutput {
public:
    // Sets the error if the file cannot be created.
    CsvOutput(std::string path, std::string& error);

    void begin(const DecodedCapture& capture) override;
    std::string end(const DecodedCapture& capture) override;

    void sample(Date time) override { _csv->sample(time); }
    void addRow(std::size_t number, const TimelineRow& row) override { _csv->addRow(number, row); }
    void set(std::size_t number, const std::string& text) override { _csv->set(number, text); }
    void clear(std::size_t number) override { _csv->clear(number); }

private:
    std::string _path;
    WholeFile _file;
    std::optional<TimelineCsv> _csv;
};

} // namespace orvex
