#include "database/DatabaseOutput.h"

#include "CaptureClock.h"
#include "Reporting.h"

#include <algorithm>

namespace orvex {

namespace {

// Those of the same rows are the same text.
std::string textOf(std::vector<std::string> fields)
{
    std::ranges::sort(fields);
    fields.erase(std::unique(fields.begin(), fields.end()), fields.end());
    std::string text;
    for (const std::string& field : fields)
        (text += text.empty() ? "" : "\n") += field;
    return text;
}

} // namespace

DatabaseOutput::DatabaseOutput(const DecodeOptions& options, std::string& error)
    : _options(options)
    , _database(*options.timelineFile)
{
    if (!error.empty())
        return;
    if (const std::string fault = _database.fault(); !fault.empty())
        error = *options.timelineFile + ": " + fault;
}

void DatabaseOutput::begin(const DecodedCapture& /*capture*/)
{
    _staged.emplace();
    _hash = {};
    _first.reset();
    _last.reset();
}

void DatabaseOutput::message(ByteView message, std::chrono::microseconds time)
{
    _hash.add(message, time);
    if (const auto date = captureDate(time)) {
        _first = std::min(*date, _first.value_or(*date));
        _last = std::max(*date, _last.value_or(*date));
    }
}

std::string DatabaseOutput::end(const DecodedCapture& capture)
{
    SqliteConnection& staged = _staged->finish({.id = _hash.value(),
        .name = capture.path == kStandardStream ? "standard input" : capture.path,
        .technology = capture.technology,
        .first = _first.value_or(Date{}), // a capture without times has failed
        .last = _last.value_or(Date{}),
        .messages = capture.counts->total().messages,
        .every = std::chrono::duration<double>(_options.sampling.every).count(),
        .fields = textOf(_options.sampling.fields)});
    if (!staged.isGood())
        return capture.path + ": temporary data: " + staged.error();
    const TimelineDatabase::Taken taken = _database.take(staged);
    if (!taken.error.empty())
        return *_options.timelineFile + ": " + taken.error;
    if (taken.known > 0)
        printNote(capture.path + ": is in " + *_options.timelineFile + " already", _options);
    if (taken.replaced > 0)
        printNote(
            capture.path + ": replaces what " + *_options.timelineFile + " had of it with other settings",
            _options);
    return {};
}

} // namespace orvex
