#include "database/DatabaseOutput.h"

#include "CaptureClock.h"
#include "Reporting.h"

#include <algorithm>
#include <set>
#include <vector>

namespace orvex {

namespace {

// The same text whatever their order.
std::string textOf(const std::vector<std::string>& fields)
{
    std::string text;
    for (const std::string& field : std::set<std::string>(fields.begin(), fields.end()))
        (text += text.empty() ? "" : "\n") += field;
    return text;
}

// A capture without times has failed.
Date dateOf(const std::optional<std::chrono::microseconds>& time)
{
    return captureDate(time.value_or(std::chrono::microseconds(0))).value_or(Date{});
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
    if (captureDate(time)) {
        _first = std::min(time, _first.value_or(time));
        _last = std::max(time, _last.value_or(time));
    }
}

std::string DatabaseOutput::end(const DecodedCapture& capture)
{
    SqliteConnection& staged = _staged->finish({.id = _hash.value(),
        .name = capture.path == kStandardStream ? "standard input" : capture.path,
        .technology = capture.technology,
        .first = dateOf(_first),
        .last = dateOf(_last),
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
