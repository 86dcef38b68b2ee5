#include "TimelineOutputs.h"

#include "CsvOutput.h"
#include "ReportOutput.h"
#include "database/DatabaseOutput.h"

namespace orvex {

TimelineOutputs::TimelineOutputs(const DecodeOptions& options)
{
    // Each is made with the error to set, and says nothing if another failed before.
    if (options.timelineFile && isDatabaseFile(*options.timelineFile))
        _outputs.push_back(std::make_unique<DatabaseOutput>(options, _error));
    else if (options.timelineFile)
        _outputs.push_back(std::make_unique<CsvOutput>(*options.timelineFile, _error));
    if (options.reportFile)
        _outputs.push_back(
            std::make_unique<ReportOutput>(*options.reportFile, options.sampling.every, _error));
}

void TimelineOutputs::begin(const DecodedCapture& capture)
{
    for (const auto& output : _outputs)
        output->begin(capture);
}

void TimelineOutputs::message(ByteView message, std::chrono::microseconds time)
{
    for (const auto& output : _outputs)
        output->message(message, time);
}

std::string TimelineOutputs::end(const DecodedCapture& capture)
{
    std::string errors;
    for (const auto& output : _outputs) {
        if (const std::string error = output->end(capture); !error.empty())
            errors += (errors.empty() ? "" : "; ") + error;
    }
    return errors;
}

void TimelineOutputs::sample(Date time)
{
    for (const auto& output : _outputs)
        output->sample(time);
}

void TimelineOutputs::addRow(std::size_t number, const TimelineRow& row)
{
    for (const auto& output : _outputs)
        output->addRow(number, row);
}

void TimelineOutputs::set(std::size_t number, const std::string& text)
{
    for (const auto& output : _outputs)
        output->set(number, text);
}

void TimelineOutputs::clear(std::size_t number)
{
    for (const auto& output : _outputs)
        output->clear(number);
}

} // namespace orvex
