#pragma once

#include "DecodeOptions.h"
#include "TimelineOutput.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex {

// All files that the options want of a timeline.
class TimelineOutputs final : public TimelineOutput {
public:
    explicit TimelineOutputs(const DecodeOptions& options);

    // Why one of them cannot be written, known before anything is decoded; empty if they can.
    const std::string& error() const { return _error; }

    void begin(const DecodedCapture& capture) override;
    void message(ByteView message, std::chrono::microseconds time) override;
    std::string end(const DecodedCapture& capture) override;

    void sample(Date time) override;
    void addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text) override;
    void clear(std::size_t number) override;

private:
    std::vector<std::unique_ptr<TimelineOutput>> _outputs;
    std::string _error;
};

} // namespace orvex
